#include "nrxctl/printers/button_reports.h"

#include <gtest/gtest.h>

#include "tests/support/report_bytes.h"
#include "tests/support/source_files.h"

namespace {

using namespace tests;

// The highest bits of every number are set.
constexpr std::uint64_t high = 0xf000000000000000;

std::vector<std::uint8_t> stats_report(std::size_t size = 282) {
    auto report = report_with(282, {{0, 8, {high + 1, high + 2, high + 3, high + 4}},
                                    {88, 8, {high + 5, high + 6, high + 7, high + 8}},
                                    {136, 8, {high + 9, high + 10, high + 11, high + 12}},
                                    {184, 8, {high + 13, high + 14, high + 15, high + 16}},
                                    {233, 4, 0xf0000005},
                                    {266, 8, 17},
                                    {274, 4, {0xf0000001, 0xf0000002}}});
    report.resize(size);
    return report;
}

std::string print_stats(const std::vector<std::uint8_t>& report) {
    return printed(nrx::print_button_stats, "wqr-button", 0xd7, report).out;
}

TEST(button_stats, prints_the_whole_table_from_its_bytes_alone) {
    const std::string text =
        "kpdx_stats\n"
        "-- Last Button Press --\n"
        "Click Count                                               : 2013265922\n"
        "Finger ON Timestamp                                       : 17293822569102704641 us\n"
        "Start Haptics Timestamp                                   : 17293822569102704643 us\n"
        "Latency - Finger Detect to Button Down                    : 17293822569102704644 us\n"
        "--Click 1--\n"
        "Latency   - Button Down to Play Asset                     : 17293822569102704653 us\n"
        "Timestamp - Button Down                                   : 17293822569102704645 us\n"
        "Timestamp - Button Down Play Asset                        : 17293822569102704649 us\n"
        "Latency   - Button Up to Play Asset                       : 17293822569102704654 us\n"
        "Timestamp - Button Up                                     : 17293822569102704646 us\n"
        "Timestamp - Button Up Play Asset                          : 17293822569102704650 us\n"
        "--Click 2--\n"
        "Latency   - Button Down to Play Asset                     : 17293822569102704655 us\n"
        "Timestamp - Button Down                                   : 17293822569102704647 us\n"
        "Timestamp - Button Down Play Asset                        : 17293822569102704651 us\n"
        "Latency   - Button Up to Play Asset                       : 17293822569102704656 us\n"
        "Timestamp - Button Up                                     : 17293822569102704648 us\n"
        "Timestamp - Button Up Play Asset                          : 17293822569102704652 us\n"
        "Second scan delta from FD                                 : 1152921504606846992 us\n"
        "Num dorran Scans                                          : 4026531841\n"
        "Num brevo Scans                                           : 4026531842\n"
        "Finger OFF Timestamp                                      : 17293822569102704642 us\n"
        "\n\n\n";
    EXPECT_EQ(print_stats(stats_report()), text);
    for (std::size_t offset = 0; offset < 282; ++offset) {
        const bool is_shown = offset < 32 || (offset >= 88 && offset < 120) ||
                              (offset >= 136 && offset < 168) || (offset >= 184 && offset < 216) ||
                              (offset >= 233 && offset < 237) || offset >= 266;
        auto report = stats_report();
        report[offset] ^= 0x80;
        EXPECT_EQ(print_stats(report) != text, is_shown) << offset;
    }
}

TEST(button_stats, a_field_beyond_a_short_report_prints_as_0) {
    print_every_prefix(nrx::print_button_stats, "wqr-button", 0xd7, stats_report(), 282,
                       source_file::button_reports);
    EXPECT_EQ(print_stats({}), "");
    const auto expect_line = [](std::size_t size, const std::string& line) {
        EXPECT_NE(print_stats(stats_report(size)).find(line), std::string::npos) << line;
    };
    expect_line(281, "dorran Scans                                          : 4026531841\n");
    expect_line(281, "brevo Scans                                           : 0\n");
    // Holds one field of the difference.
    expect_line(100, "Second scan delta from FD                                 : 0 us\n");
}

std::string print_assets(const std::vector<std::uint8_t>& report) {
    const auto result = printed(nrx::print_haptic_assets, "wqr-button", 0xd8, report);
    EXPECT_EQ(result.err, "");
    return result.out;
}

TEST(haptic_assets, prints_an_entry_for_every_speed_and_event) {
    struct asset {
        std::size_t entry;
        std::uint64_t enable, gain, min, max, slot;
        std::string text;
    };
    const std::vector<asset> assets{
        {0, 1, 98304, 10, 20, 3, "enable 1, slot 3, gain 1.5, min 10, max 20\n"},
        {15, 0x80, 0xffff0000, high, 1, 0xfffffffe,
         "enable 1, slot -2, gain -1, min 17293822569102704640, max 1\n"},
        {16, 2, 65536, 0, 0, 0, "enable 1, slot 0, gain 1, min 0, max 0\n"},
        {18, 1, 1, 0, 0, 0, "enable 1, slot 0, gain 1.52588e-05, min 0, max 0\n"},
        {50, 1, 0x7fffffff, 5, high, 9,
         "enable 1, slot 9, gain 32768, min 5, max 17293822569102704640\n"},
    };
    std::vector<std::uint8_t> report(1479);
    std::vector<std::string> values(51, "enable 0, slot 0, gain 0, min 0, max 0\n");
    for (const auto& [entry, enable, gain, min, max, slot, text] : assets) {
        const auto bytes =
            report_with(29, {{0, 1, enable}, {1, 4, gain}, {5, 8, {min, max}}, {21, 4, slot}});
        std::copy(bytes.begin(), bytes.end(),
                  report.begin() + static_cast<std::ptrdiff_t>(29 * entry));
        values[entry] = text;
    }
    std::string expected = "Length: 1479, expected 1479\n";
    auto value = values.begin();
    for (const std::string speed : {"Slow", "Medium", "Fast"}) {
        for (const std::string event :
             {"SingleDown", "SingleUp", "DoubleDown", "DoubleUp", "TripleDown", "TripleUp",
              "SingleTapOn", "SingleTapOff", "DoubleTapOn", "DoubleTapOff", "TripleTapOn",
              "TripleTapOff", "DeepDown", "DeepUp", "LongPress", "LongPressUp", ""}) {
            expected += "ASSET [" + speed + "][" + event + "]: " + *value++;
        }
    }
    EXPECT_EQ(print_assets(report), expected);
}

TEST(haptic_assets, only_the_first_line_shows_another_length) {
    EXPECT_EQ(print_assets({}), "");
    const std::string first = "ASSET [Slow][SingleDown]: enable 1, slot ";
    const std::string whole = first + "16843009, gain 257.004, min 72340172838076673, max 72";
    for (const std::size_t size : {1U, 4U, 5U, 24U, 25U, 28U, 29U, 30U, 1471U, 1478U, 2000U}) {
        const auto text = print_assets(std::vector<std::uint8_t>(size, 1));
        EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 52) << size;
        EXPECT_EQ(text.rfind("Length: " + std::to_string(size) + ", expected 1479\n" + first, 0),
                  0U);
        EXPECT_EQ(text.find(whole) != std::string::npos, size >= 25) << size;
    }
    EXPECT_NE(print_assets({1, 1, 1, 1, 1}).find(first + "0, gain 257.004, min 0, max 0\n"),
              std::string::npos);
}

}  // namespace
