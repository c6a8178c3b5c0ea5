#include "nrxctl/printers/diag_report.h"

#include <gtest/gtest.h>

#include "tests/support/report_bytes.h"

namespace {

using namespace tests;
using bytes = std::vector<std::uint8_t>;

constexpr const char* source = "nrxctl/printers/diag_report.cpp";

std::string printed(std::string_view service, std::int32_t report_id, const bytes& report) {
    return tests::printed(nrx::print_diag_report, service, report_id, report).out;
}

bytes scan_state() {
    return report_with(40, {{0, 4, {0x8000, 5, 6}}, {20, 4, {7, 10, 3, 10, 12}}});
}

bytes link_counters() {
    return report_with(64, {{0, 4, 1},
                            {4, 8, 0x100000002},
                            {12, 4, {3, 4, 5, 6}},
                            {28, 8, 0x700000007},
                            {36, 4, {0xffffffff, 9, 10, 11, 12}},
                            {56, 8, 13}});
}

TEST(diag_report, of_morvane_is_the_scan_state_whatever_the_report) {
    for (const std::int32_t report_id : {0xd0, 0xf7, -1}) {
        EXPECT_EQ(printed("morvane", report_id, scan_state()),
                  "scanState                      : 3\n"
                  "nextScan in                    : 25.6 sec\n"
                  "numLoFiReads                   : 10\n"
                  "numFramesSinceOnWrist          : 7\n"
                  "numLoFiScans_Accepted          : 12\n"
                  "numLoFiScans_Rejected          : 4294967294\n"
                  "\n"
                  "waitNumFramesAfterSuccess      : 6\n"
                  "motionTriggerNumFrames         : 5\n"
                  "accelVarThreshold              : 0.5\n"
                  "\n");
    }
    print_every_prefix(nrx::print_diag_report, "morvane", 0xd0, scan_state(), 40, source);
}

TEST(diag_report, of_morvane_has_a_signed_threshold_in_single_precision) {
    const auto threshold = [](std::uint64_t word) {
        const auto text = printed("morvane", 0xd0, report_with(40, {{0, 4, word}}, 0));
        return text.substr(text.find("accelVarThreshold"));
    };
    EXPECT_EQ(threshold(0xffff0000), "accelVarThreshold              : -1\n\n");
    EXPECT_EQ(threshold(0x7fffffff), "accelVarThreshold              : 32768\n\n");
    EXPECT_EQ(threshold(0x0000028f), "accelVarThreshold              : 0.00999451\n\n");
}

TEST(diag_report, of_mux_is_a_line_for_each_whole_record) {
    const auto report =
        report_with(30, {{0, 8, 1}, {8, 4, 5}, {12, 8, 0xffffffffffffffff}, {20, 4, 0xabcdef}});
    EXPECT_EQ(printed("mux", 0xd0, report),
              "data: 5 timestamp:1\n"
              "data:abcdef timestamp:18446744073709551615\n");
    EXPECT_EQ(printed("mux", 0xd0, bytes(11)), "");
    EXPECT_EQ(printed("mux", 0xd0, bytes(12)), "data: 0 timestamp:0\n");
}

TEST(diag_report, of_baseband_is_its_link_counters) {
    EXPECT_EQ(printed("baseband", 0xd0, link_counters()),
              "num_resets                   : 1\n"
              "last_reset_ts                : 4294967298\n"
              "num_packets_sent             : 3\n"
              "num_commands_sent            : 4\n"
              "num_responses_sent           : 5\n"
              "num_reports_sent             : 6\n"
              "last_send_ts                 : 30064771079\n"
              "num_good_packets_received    : 4294967295\n"
              "num_bad_packets_received     : 9\n"
              "num_commands_recv            : 10\n"
              "num_responses_recv           : 11\n"
              "num_reports_recv             : 12\n"
              "last_recv_ts                 : 13\n"
              "\n");
    print_every_prefix(nrx::print_diag_report, "baseband", 0xd0, link_counters(), 64, source);
}

TEST(diag_report, of_any_other_service_or_report_is_a_dump_and_without_bytes_nothing) {
    const std::vector<std::pair<const char*, std::int32_t>> dumped{
        {"arc", 0xd0}, {"btmspk", 0xd0}, {"wqr-button", 0xd0}, {"Morvane", 0xd0},
        {"MUX", 0xd0}, {"", 0xd0},       {"mux", 0xd1},        {"baseband", 0xd1},
    };
    for (const auto& [service, id] : dumped) {
        EXPECT_EQ(printed(service, id, {'A', 'B'}),
                  "00000000: 41 42                                             | AB\n")
            << service;
    }
    for (const char* service : {"morvane", "mux", "baseband", "arc"}) {
        const auto result = tests::printed(nrx::print_diag_report, service, 0xd0, {});
        EXPECT_EQ(result.out + result.err, "") << service;
    }
}

}  // namespace
