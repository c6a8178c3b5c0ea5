// Numbers and payloads as users type them.
#include <limits>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/numbers.h"
#include "nrxctl/base/payload.h"
#include "tests/support/capture.h"
#include "tests/support/word_vector.h"

namespace {

using namespace tests;

TEST(parse_number, reads_decimal_and_prefixed_hexadecimal) {
    constexpr auto largest = std::numeric_limits<std::int64_t>::max();
    const std::map<std::string, std::int64_t> rows{{"0", 0},
                                                   {"7", 7},
                                                   {"+7", 7},
                                                   {"-7", -7},
                                                   {"007", 7},
                                                   {"0x1f", 31},
                                                   {"-0x10", -16},
                                                   {"+0xAb", 171},
                                                   {"0x0", 0},
                                                   {"0x0123456789abcdEF", 0x0123456789abcdef},
                                                   {"999999999999999", 999999999999999},
                                                   {"1000000000000000", 1000000000000000},
                                                   {"0xfffffffffffffff", 0xfffffffffffffff},
                                                   {"9223372036854775807", largest},
                                                   {"-9223372036854775807", -largest},
                                                   {"0x7fffffffffffffff", largest}};
    for (const auto& [word, value] : rows)
        EXPECT_EQ(nrx::parse_number(word, "bad"), value) << word;
}

TEST(parse_number, ends_the_process_with_the_message_and_the_word) {
    for (const std::string& word :
         split(",12a,a,-,+,--5,+-5,- 5, 5,5 ,1.5,0x,-0x,0X1f,0x1g,0x-1,0x "
               "1,x1,5:,5/,0x5G,0x5@,0x5`,12345678901234g,"
               "12345678901234567a,\xff\xff\xff\xff\xff\xff\xff\xff\xff\xff\xff\xff\xff\xff\xff,"
               "9223372036854775808,"
               "-9223372036854775808,0x8000000000000000,0x10000000000000000",
               ',')) {
        const auto refused = capture([&] { nrx::parse_number(word, "duration is invalid"); });
        EXPECT_EQ(refused.status, 1) << word;
        EXPECT_EQ(refused.out, "duration is invalid (" + word + ")\n");
        EXPECT_EQ(refused.err, "");
    }
}

// Digit by digit, for runs that fit.
std::optional<std::int64_t> slowly_read(std::string_view digits, int base) {
    std::int64_t value = 0;
    for (const char c : digits) {
        const std::string_view known = "0123456789abcdef0123456789ABCDEF";
        const auto found = known.find(c);
        const auto digit = static_cast<std::int64_t>(found % 16);
        if (found == std::string_view::npos || digit >= base) return std::nullopt;
        value = value * base + digit;
    }
    return value;
}

TEST(read_digits, any_byte_at_any_place_of_a_run_of_any_length) {
    for (const int base : {10, 16}) {
        EXPECT_FALSE(nrx::read_digits("", base));
        for (std::size_t length = 1; length <= 16; ++length) {
            const auto whole =
                std::string_view(base == 10 ? "1234567890123456" : "1a2Bc3D4e5F67890")
                    .substr(16 - length);
            for (std::size_t place = 0; place < length; ++place) {
                for (int byte = 0; byte < 256; ++byte) {
                    // In memory of its own size: nothing beyond may be read.
                    std::vector<char> run(whole.begin(), whole.end());
                    run[place] = static_cast<char>(byte);
                    if (base == 16 && length == 16 && place == 0 && byte > '7') continue;
                    const std::string_view digits(run.data(), run.size());
                    ASSERT_EQ(nrx::read_digits(digits, base), slowly_read(digits, base))
                        << base << ' ' << digits;
                }
            }
        }
    }
}

struct packed {
    int position;
    std::vector<std::uint8_t> payload;
};

packed pack(std::vector<std::string> words, int position = 0) {
    const word_vector all(std::move(words));
    packed result{position, {0xee}};
    nrx::parse_payload(all.all(), result.position, result.payload);
    return result;
}

TEST(parse_payload, packs_values_of_one_width_little_endian) {
    struct row {
        std::vector<std::string> words;
        std::vector<std::uint8_t> payload;
        int position;
    };
    const std::vector<row> rows{
        {{"u16", "10", "0d10", "-x"}, {0x10, 0, 10, 0}, 3},
        {{"1", "ff", "0xFF", "0d255"}, {1, 0xff, 0xff, 0xff}, 4},
        {{"u8", "7"}, {7}, 2},
        {{"u32", "12345678", "0d2147483647"}, {0x78, 0x56, 0x34, 0x12, 0xff, 0xff, 0xff, 0x7f}, 3},
        {{"u32"}, {}, 1},
        {{"-5", "1"}, {}, 0},
        {{}, {}, 0},
    };
    for (const row& one : rows) {
        const packed result = pack(one.words);
        EXPECT_EQ(result.payload, one.payload) << ::testing::PrintToString(one.words);
        EXPECT_EQ(result.position, one.position) << ::testing::PrintToString(one.words);
    }
}

TEST(parse_payload, starts_at_the_position_and_takes_a_width_only_there) {
    EXPECT_EQ(pack({"--command", "x", "u16", "1"}, 2).payload, (std::vector<std::uint8_t>{1, 0}));
    EXPECT_TRUE(pack({"a"}, 1).payload.empty());
    EXPECT_TRUE(pack({"a"}, 7).payload.empty());
    EXPECT_EQ(capture([] { pack({"1", "u16"}); }).out, "payload value is invalid (u16)\n");
}

TEST(parse_payload, refuses_what_does_not_fit_the_width) {
    const std::vector<std::pair<std::vector<std::string>, std::string>> rows{
        {{"1ff"}, "Value 511 (01ff) is bigger than allowed (255, 0xff)\n"},
        {{"100"}, "Value 256 (0100) is bigger than allowed (255, 0xff)\n"},
        {{"u16", "1", "10000"}, "Value 65536 (010000) is bigger than allowed (65535, 0xffff)\n"},
        {{"0d-5"}, "Value -5 (0fffffffffffffffb) is bigger than allowed (255, 0xff)\n"},
        {{"u32", "0d-1"},
         "Value -1 (0ffffffffffffffff) is bigger than allowed (4294967295, 0xffffffff)\n"},
    };
    for (const auto& [words, message] : rows) {
        const auto refused = capture([&packed_words = words] { pack(packed_words); });
        EXPECT_EQ(refused.status, 1);
        EXPECT_EQ(refused.out, message);
    }
}

TEST(parse_payload, refuses_words_that_are_no_number_in_32_bits) {
    for (const char* word : {"", "xyz", "0d", "0dff", "0d1.5", "0x", "0x-5", "1 2", "80000000",
                             "0d2147483648", "0d-2147483649", "0d--1", "123456789012345678901"}) {
        const auto refused = capture([&] { pack({"u32", word}); });
        EXPECT_EQ(refused.status, 1) << word;
        EXPECT_EQ(refused.out, "payload value is invalid (" + std::string(word) + ")\n");
    }
}

}  // namespace
