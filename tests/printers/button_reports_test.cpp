// The two reports of the button service that have printers of their own.
#include <sstream>

#include <gtest/gtest.h>

#include "nrxctl/printers/button_stats.h"
#include "nrxctl/printers/haptic_assets.h"
#include "tests/support/report_bytes.h"

namespace {

using namespace tests;

std::string stats_of(const std::vector<std::uint8_t>& report) {
    return printed(nrx::print_button_stats, "wqr-button", 0xd7, report).out;
}

std::vector<std::uint8_t> stats_report() {
    return report_with(282, {{0, 8, {1000, 9000, 1500, 450}},
                             {88, 8, {1450, 2450, 3450, 4450}},
                             {136, 8, {1503, 2504, 3505, 4506}},
                             {184, 8, {53, 54, 55, 56}},
                             {233, 4, 5},
                             {266, 8, 1016},
                             {274, 4, {77, 88}}});
}

constexpr const char* stats_text =
    "kpdx_stats\n"
    "-- Last Button Press --\n"
    "Click Count                                               : 2\n"
    "Finger ON Timestamp                                       : 1000 us\n"
    "Start Haptics Timestamp                                   : 1500 us\n"
    "Latency - Finger Detect to Button Down                    : 450 us\n"
    "--Click 1--\n"
    "Latency   - Button Down to Play Asset                     : 53 us\n"
    "Timestamp - Button Down                                   : 1450 us\n"
    "Timestamp - Button Down Play Asset                        : 1503 us\n"
    "Latency   - Button Up to Play Asset                       : 54 us\n"
    "Timestamp - Button Up                                     : 2450 us\n"
    "Timestamp - Button Up Play Asset                          : 2504 us\n"
    "--Click 2--\n"
    "Latency   - Button Down to Play Asset                     : 55 us\n"
    "Timestamp - Button Down                                   : 3450 us\n"
    "Timestamp - Button Down Play Asset                        : 3505 us\n"
    "Latency   - Button Up to Play Asset                       : 56 us\n"
    "Timestamp - Button Up                                     : 4450 us\n"
    "Timestamp - Button Up Play Asset                          : 4506 us\n"
    "Second scan delta from FD                                 : 16 us\n"
    "Num dorran Scans                                          : 77\n"
    "Num brevo Scans                                           : 88\n"
    "Finger OFF Timestamp                                      : 9000 us\n"
    "\n\n\n";

TEST(button_stats, prints_the_whole_table_and_nothing_without_bytes) {
    EXPECT_EQ(stats_of(stats_report()), stats_text);
    EXPECT_EQ(stats_of({}), "");
    print_every_prefix(nrx::print_button_stats, "wqr-button", 0xd7, stats_report(), 282,
                       "nrxctl/printers/button_stats.cpp");
}

TEST(button_stats, reads_its_numbers_unsigned_and_lets_the_delta_wrap) {
    const auto text = stats_of(report_with(
        282, {{0, 8, 0xffffffffffffffff}, {233, 4, 0xffffffff}, {266, 8, 4}, {274, 4, 0x80000000}},
        0));
    for (const char* line :
         {"Click Count                                               : 2147483647\n",
          "Finger ON Timestamp                                       : 18446744073709551615 us\n",
          "Second scan delta from FD                                 : 5 us\n",
          "Num dorran Scans                                          : 2147483648\n"}) {
        EXPECT_NE(text.find(line), std::string::npos) << line;
    }
}

TEST(button_stats, a_byte_shows_exactly_if_a_field_holds_it) {
    const auto shows = [](std::size_t offset) {
        return offset < 32 || (offset >= 88 && offset < 120) || (offset >= 136 && offset < 168) ||
               (offset >= 184 && offset < 216) || (offset >= 233 && offset < 237) || offset >= 266;
    };
    for (std::size_t offset = 0; offset < 282; ++offset) {
        auto report = stats_report();
        report[offset] ^= 0x80;
        EXPECT_EQ(stats_of(report) != stats_text, shows(offset)) << offset;
    }
}

TEST(button_stats, prints_zeros_for_what_a_short_report_does_not_hold) {
    auto report = stats_report();
    report.resize(281);
    EXPECT_NE(stats_of(report).find(
                  "Num dorran Scans                                          : 77\n"
                  "Num brevo Scans                                           : 0\n"
                  "Finger OFF Timestamp                                      : 9000 us\n"),
              std::string::npos);
    // Half a difference is no number: 100 bytes hold the finger-on time, but not the second scan.
    report.resize(100);
    EXPECT_NE(
        stats_of(report).find("Second scan delta from FD                                 : 0 us\n"),
        std::string::npos);
}

// The lines of the printed assets.
std::vector<std::string> assets_of(const std::vector<std::uint8_t>& report) {
    const auto result = printed(nrx::print_haptic_assets, "wqr-button", 0xd8, report);
    EXPECT_EQ(result.err, "");
    std::istringstream from(result.out);
    std::vector<std::string> lines;
    for (std::string line; std::getline(from, line);)
        lines.push_back(line);
    return lines;
}

TEST(haptic_assets, prints_an_entry_of_every_speed_and_event) {
    // Slow SingleDown; Slow LongPressUp; the nameless event of Slow; Medium SingleUp; the last
    // entry.
    const auto report = report_with(1479,
                                    {{0, 1, 1},
                                     {1, 4, 98304},
                                     {5, 8, {10, 20}},
                                     {21, 4, 3},
                                     {435, 1, 0x80},
                                     {436, 4, 0xffff0000},
                                     {440, 8, {0xffffffffffffffff, 1}},
                                     {456, 4, 0xfffffffe},
                                     {464, 1, 2},
                                     {465, 4, 65536},
                                     {522, 1, 1},
                                     {523, 4, 1},
                                     {1450, 1, 1},
                                     {1451, 4, 0x7fffffff},
                                     {1455, 8, {5, 6}},
                                     {1471, 4, 9}},
                                    0);
    std::vector<std::string> expected{"Length: 1479, expected 1479"};
    for (const std::string speed : {"Slow", "Medium", "Fast"}) {
        for (const std::string event :
             {"SingleDown", "SingleUp", "DoubleDown", "DoubleUp", "TripleDown", "TripleUp",
              "SingleTapOn", "SingleTapOff", "DoubleTapOn", "DoubleTapOff", "TripleTapOn",
              "TripleTapOff", "DeepDown", "DeepUp", "LongPress", "LongPressUp", ""}) {
            expected.push_back("ASSET [" + speed + "][" + event +
                               "]: enable 0, slot 0, gain 0, min 0, max 0");
        }
    }
    expected[1] = "ASSET [Slow][SingleDown]: enable 1, slot 3, gain 1.5, min 10, max 20";
    expected[16] =
        "ASSET [Slow][LongPressUp]: enable 1, slot -2, gain -1, min 18446744073709551615, max 1";
    expected[17] = "ASSET [Slow][]: enable 1, slot 0, gain 1, min 0, max 0";
    expected[19] = "ASSET [Medium][SingleUp]: enable 1, slot 0, gain 1.52588e-05, min 0, max 0";
    expected[51] = "ASSET [Fast][]: enable 1, slot 9, gain 32768, min 5, max 6";
    EXPECT_EQ(assets_of(report), expected);
}

TEST(haptic_assets, the_length_line_is_the_only_sign_of_another_size) {
    EXPECT_TRUE(assets_of({}).empty());
    for (const std::size_t size : {1U, 4U, 5U, 28U, 29U, 30U, 1471U, 1478U, 2000U}) {
        const auto lines = assets_of(std::vector<std::uint8_t>(size, 1));
        ASSERT_EQ(lines.size(), 52U);
        EXPECT_EQ(lines[0], "Length: " + std::to_string(size) + ", expected 1479");
        const bool is_whole = lines[1] ==
                              "ASSET [Slow][SingleDown]: enable 1, slot 16843009, gain 257.004, "
                              "min 72340172838076673, max 72340172838076673";
        EXPECT_EQ(is_whole, size >= 25) << size;
    }
    EXPECT_EQ(assets_of({1, 1, 1, 1, 1})[1],
              "ASSET [Slow][SingleDown]: enable 1, slot 0, gain 257.004, min 0, max 0");
}

}  // namespace
