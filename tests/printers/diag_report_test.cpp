#include "nrxctl/printers/diag_report.h"

#include <gtest/gtest.h>

#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"
#include "tests/support/source_files.h"

namespace {

using namespace tests;
using bytes = std::vector<std::uint8_t>;

std::string print(std::string_view service, nrx::report_id id, const bytes& report) {
    return printed(nrx::print_diag_report, service, id, report).out;
}

TEST(diag_report, morvane_report_of_any_id_prints_the_scan_state) {
    auto report =
        report_with(40, {{0, 4, {0x8000, 0xf0000001, 0xf0000002}},
                         {20, 4, {0xf0000003, 0xf0000004, 0xf0000005, 0xf0000006, 0xf0000007}}});
    for (const nrx::report_id id : {0xd0U, 0xf7U, 0xffffffffU}) {
        EXPECT_EQ(print("morvane", id, report),
                  "scanState                      : 4026531845\n"
                  "nextScan in                    : 1.03079e+10 sec\n"
                  "numLoFiReads                   : 4026531844\n"
                  "numFramesSinceOnWrist          : 4026531843\n"
                  "numLoFiScans_Accepted          : 4026531847\n"
                  "numLoFiScans_Rejected          : 4294967293\n"
                  "\n"
                  "waitNumFramesAfterSuccess      : 4026531842\n"
                  "motionTriggerNumFrames         : 4026531841\n"
                  "accelVarThreshold              : 0.5\n"
                  "\n");
    }
    print_every_prefix(nrx::print_diag_report, "morvane", 0xd0, report, 40,
                       source_file::diag_report);
    // Holds one field of the difference.
    report.resize(38);
    EXPECT_NE(print("morvane", 0xd0, report).find("numLoFiScans_Rejected          : 0\n"),
              std::string::npos);
}

TEST(diag_report, morvane_threshold_is_signed_and_single_precision) {
    const rows<std::uint64_t, std::string> thresholds{
        {0xffff0000, "-1"}, {0x7fffffff, "32768"}, {0x0000028f, "0.00999451"}};
    for (const auto& [word, text] : thresholds) {
        EXPECT_TRUE(print("morvane", 0xd0, report_with(40, {{0, 4, word}}))
                        .ends_with("accelVarThreshold              : " + text + "\n\n"));
    }
}

TEST(diag_report, mux_report_prints_a_line_for_each_complete_record) {
    const auto report =
        report_with(30, {{0, 8, 1}, {8, 4, 5}, {12, 8, 0xffffffffffffffff}, {20, 4, 0xf0abcdef}});
    EXPECT_EQ(print("mux", 0xd0, report),
              "data: 5 timestamp:1\n"
              "data:f0abcdef timestamp:18446744073709551615\n");
    EXPECT_EQ(print("mux", 0xd0, bytes(11)), "");
    EXPECT_EQ(print("mux", 0xd0, bytes(12)), "data: 0 timestamp:0\n");
}

TEST(diag_report, baseband_report_prints_its_link_counters) {
    const auto report =
        report_with(64, {{0, 4, 0xf0000001},
                         {4, 8, 0xf000000000000002},
                         {12, 4, {0xf0000003, 0xf0000004, 0xf0000005, 0xf0000006}},
                         {28, 8, 0xf000000000000007},
                         {36, 4, {0xf0000008, 0xf0000009, 0xf000000a, 0xf000000b, 0xf000000c}},
                         {56, 8, 0xf00000000000000d}});
    EXPECT_EQ(print("baseband", 0xd0, report),
              "num_resets                   : 4026531841\n"
              "last_reset_ts                : 17293822569102704642\n"
              "num_packets_sent             : 4026531843\n"
              "num_commands_sent            : 4026531844\n"
              "num_responses_sent           : 4026531845\n"
              "num_reports_sent             : 4026531846\n"
              "last_send_ts                 : 17293822569102704647\n"
              "num_good_packets_received    : 4026531848\n"
              "num_bad_packets_received     : 4026531849\n"
              "num_commands_recv            : 4026531850\n"
              "num_responses_recv           : 4026531851\n"
              "num_reports_recv             : 4026531852\n"
              "last_recv_ts                 : 17293822569102704653\n"
              "\n");
    print_every_prefix(nrx::print_diag_report, "baseband", 0xd0, report, 64,
                       source_file::diag_report);
}

TEST(diag_report, other_service_is_dumped_and_empty_report_prints_nothing) {
    const rows<const char*, nrx::report_id> dumped{
        {"arc", 0xd0}, {"btmspk", 0xd0}, {"wqr-button", 0xd0}, {"Morvane", 0xd0},
        {"MUX", 0xd0}, {"", 0xd0},       {"mux", 0xd1},        {"baseband", 0xd1},
    };
    for (const auto& [service, id] : dumped) {
        EXPECT_EQ(print(service, id, {'A', 'B'}),
                  "00000000: 41 42                                             | AB\n")
            << service;
    }
    for (const char* service : {"morvane", "mux", "baseband", "arc"}) {
        const auto result = printed(nrx::print_diag_report, service, 0xd0, {});
        EXPECT_EQ(result.out + result.err, "") << service;
    }
}

}  // namespace
