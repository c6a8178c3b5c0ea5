#include "nrxctl/printers/diag_report.h"

#include <gtest/gtest.h>

#include "tests/support/report_bytes.h"

namespace {

using nrx::print_diag_report;
using tests::printed;
using tests::report_with;

constexpr const char* source = "nrxctl/printers/diag_report.cpp";

const std::vector<std::uint8_t> scan_state = report_with(40, {{0, 4, 0x8000},
                                                              {4, 4, 5},
                                                              {8, 4, 6},
                                                              {20, 4, 7},
                                                              {24, 4, 10},
                                                              {28, 4, 3},
                                                              {32, 4, 10},
                                                              {36, 4, 12}});

constexpr const char* scan_state_text =
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
    "\n";

TEST(diag_report, of_morvane_is_the_scan_state_whatever_the_report) {
    EXPECT_EQ(printed(print_diag_report, "morvane", 0xd0, scan_state).out, scan_state_text);
    EXPECT_EQ(printed(print_diag_report, "morvane", 0xf7, scan_state).out, scan_state_text);
    EXPECT_EQ(printed(print_diag_report, "morvane", -1, scan_state).out, scan_state_text);
    tests::print_every_prefix(print_diag_report, "morvane", 0xd0, scan_state, 40, source);
}

TEST(diag_report, of_morvane_has_a_signed_threshold_in_single_precision) {
    const auto threshold = [](std::uint64_t word) {
        const auto text =
            printed(print_diag_report, "morvane", 0xd0, report_with(40, {{0, 4, word}}, 0)).out;
        return text.substr(text.find("accelVarThreshold"));
    };
    EXPECT_EQ(threshold(0xffff0000), "accelVarThreshold              : -1\n\n");
    EXPECT_EQ(threshold(0x7fffffff), "accelVarThreshold              : 32768\n\n");
    EXPECT_EQ(threshold(0x0000028f), "accelVarThreshold              : 0.00999451\n\n");
}

TEST(diag_report, of_mux_is_a_line_for_each_whole_record) {
    const auto report =
        report_with(30, {{0, 8, 1}, {8, 4, 5}, {12, 8, 0xffffffffffffffff}, {20, 4, 0xabcdef}});
    EXPECT_EQ(printed(print_diag_report, "mux", 0xd0, report).out,
              "data: 5 timestamp:1\n"
              "data:abcdef timestamp:18446744073709551615\n");
    EXPECT_EQ(printed(print_diag_report, "mux", 0xd0, std::vector<std::uint8_t>(11)).out, "");
    EXPECT_EQ(printed(print_diag_report, "mux", 0xd0, std::vector<std::uint8_t>(12)).out,
              "data: 0 timestamp:0\n");
    EXPECT_EQ(printed(print_diag_report, "mux", 0xd1, std::vector<std::uint8_t>(2)).out,
              "00000000: 00 00                                             | ..\n");
}

const std::vector<std::uint8_t> link_counters = report_with(64, {{0, 4, 1},
                                                                 {4, 8, 0x100000002},
                                                                 {12, 4, 3},
                                                                 {16, 4, 4},
                                                                 {20, 4, 5},
                                                                 {24, 4, 6},
                                                                 {28, 8, 0x700000007},
                                                                 {36, 4, 0xffffffff},
                                                                 {40, 4, 9},
                                                                 {44, 4, 10},
                                                                 {48, 4, 11},
                                                                 {52, 4, 12},
                                                                 {56, 8, 13}});

TEST(diag_report, of_baseband_is_its_link_counters_in_report_0xd0_only) {
    EXPECT_EQ(printed(print_diag_report, "baseband", 0xd0, link_counters).out,
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
    tests::print_every_prefix(print_diag_report, "baseband", 0xd0, link_counters, 64, source);
    EXPECT_EQ(printed(print_diag_report, "baseband", 0xd1, {1}).out,
              "00000000: 01                                                | .\n");
}

TEST(diag_report, of_any_other_service_is_a_dump) {
    const std::string dump = "00000000: 41 42                                             | AB\n";
    for (const char* service : {"arc", "btmspk", "wqr-button", "Morvane", "MUX", ""}) {
        EXPECT_EQ(printed(print_diag_report, service, 0xd0, {'A', 'B'}).out, dump) << service;
    }
}

TEST(diag_report, prints_zeros_for_what_a_short_report_does_not_hold) {
    const std::vector<std::uint8_t> up_to_reads(scan_state.begin(), scan_state.begin() + 28);
    EXPECT_EQ(printed(print_diag_report, "morvane", 0xd0, up_to_reads).out,
              "scanState                      : 0\n"
              "nextScan in                    : 0 sec\n"
              "numLoFiReads                   : 10\n"
              "numFramesSinceOnWrist          : 7\n"
              "numLoFiScans_Accepted          : 0\n"
              "numLoFiScans_Rejected          : 0\n"
              "\n"
              "waitNumFramesAfterSuccess      : 6\n"
              "motionTriggerNumFrames         : 5\n"
              "accelVarThreshold              : 0.5\n"
              "\n");
    const std::vector<std::uint8_t> half_a_time(link_counters.begin(), link_counters.begin() + 11);
    const auto text = printed(print_diag_report, "baseband", 0xd0, half_a_time).out;
    EXPECT_TRUE(
        text.starts_with("num_resets                   : 1\n"
                         "last_reset_ts                : 0\n"
                         "num_packets_sent             : 0\n"));
}

TEST(diag_report, without_bytes_prints_nothing) {
    for (const char* service : {"morvane", "mux", "baseband", "arc"}) {
        const auto result = printed(print_diag_report, service, 0xd0, {});
        EXPECT_EQ(result.out + result.err, "") << service;
    }
}

}  // namespace
