// Numbers and payloads as users type them.
#include <limits>
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
    using row = std::pair<std::string, std::int64_t>;
    for (const auto& [word, value] :
         {row{"0", 0}, row{"7", 7}, row{"+7", 7}, row{"-7", -7}, row{"007", 7}, row{"0x1f", 31},
          row{"-0x10", -16}, row{"+0xAb", 171}, row{"0x0", 0}, row{"0x89abCDEF", 0x89abcdef},
          row{"-0x89abcdef", -0x89abcdefLL}, row{"0x7fffffffffffffff", largest},
          row{"0x0123456789abcdEF", 0x0123456789abcdef}, row{"999999999999999", 999999999999999},
          row{"1000000000000000", 1000000000000000}, row{"0xfffffffffffffff", 0xfffffffffffffff},
          row{"9223372036854775807", largest}, row{"-9223372036854775807", -largest}})
        EXPECT_EQ(nrx::parse_number(word, "bad"), value) << word;
}

TEST(parse_number, ends_the_process_with_the_message_and_the_word) {
    for (const std::string& word :
         split(",12a,a,-,+,--5,+-5,- 5, 5,5 ,1.5,0x,-0x,0X1f,0x1g,0x-1,0x "
               "1,x1,5:,5/,0x5G,0x5@,0x5`,0x89abcdeg,0x-1234567,12345678901234g,"
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

    bool operator==(const packed&) const = default;
};

packed pack(std::vector<std::string> words, int position = 0) {
    const word_vector all(std::move(words));
    packed result{position, {0xee}};
    nrx::parse_payload(all.all(), result.position, result.payload);
    return result;
}

TEST(parse_payload, packs_values_of_one_width_little_endian) {
    EXPECT_EQ(pack({"u16", "10", "0d10", "-x"}), (packed{3, {0x10, 0, 10, 0}}));
    EXPECT_EQ(pack({"1", "ff", "0xFF", "0d255"}), (packed{4, {1, 0xff, 0xff, 0xff}}));
    EXPECT_EQ(pack({"u8", "7"}), (packed{2, {7}}));
    EXPECT_EQ(pack({"u32", "12345678", "0d2147483647"}),
              (packed{3, {0x78, 0x56, 0x34, 0x12, 0xff, 0xff, 0xff, 0x7f}}));
    EXPECT_EQ(pack({"u32"}), (packed{1, {}}));
    EXPECT_EQ(pack({"-5", "1"}), (packed{0, {}}));
    EXPECT_EQ(pack({}), (packed{0, {}}));
}

TEST(parse_payload, starts_at_the_position_and_takes_a_width_only_there) {
    EXPECT_EQ(pack({"--command", "x", "u16", "1"}, 2), (packed{4, {1, 0}}));
    EXPECT_EQ(pack({"a"}, 1), (packed{1, {}}));
    EXPECT_EQ(pack({"a"}, 7), (packed{7, {}}));
    EXPECT_EQ(capture([] { pack({"1", "u16"}); }).out, "payload value is invalid (u16)\n");
}

TEST(parse_payload, refuses_what_does_not_fit_the_width_and_what_is_no_number_in_32_bits) {
    std::vector<std::pair<std::vector<std::string>, std::string>> rows{
        {{"1ff"}, "Value 511 (01ff) is bigger than allowed (255, 0xff)\n"},
        {{"100"}, "Value 256 (0100) is bigger than allowed (255, 0xff)\n"},
        {{"u16", "1", "10000"}, "Value 65536 (010000) is bigger than allowed (65535, 0xffff)\n"},
        {{"0d-5"}, "Value -5 (0fffffffffffffffb) is bigger than allowed (255, 0xff)\n"},
        {{"u16", "u8", "1"}, "payload value is invalid (u8)\n"},
        {{"u32", "0d-1"},
         "Value -1 (0ffffffffffffffff) is bigger than allowed (4294967295, 0xffffffff)\n"},
    };
    for (const std::string word :
         {"", "xyz", "0d", "0dff", "0d1.5", "0x", "0x-5", "1 2", "80000000", "0d2147483648",
          "0d-2147483649", "0d--1", "123456789012345678901"})
        rows.push_back({{"u32", word}, "payload value is invalid (" + word + ")\n"});
    for (const auto& [words, message] : rows) {
        const auto refused = capture([&packed_words = words] { pack(packed_words); });
        EXPECT_EQ(refused.status, 1);
        EXPECT_EQ(refused.out, message);
    }
}

}  // namespace
