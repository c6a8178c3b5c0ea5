// Numbers and payloads as users type them.
#include "nrxctl/base/numbers.h"

#include <limits>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/payload.h"
#include "tests/support/argument_vector.h"
#include "tests/support/capture.h"
#include "tests/support/rows.h"

namespace tests {

namespace {

TEST(parse_number, reads_decimal_and_prefixed_hexadecimal) {
    using row = std::pair<std::string, std::int64_t>;
    constexpr auto max = std::numeric_limits<std::int64_t>::max();
    for (const auto& [argument, value] :
         {row{"0", 0}, row{"7", 7}, row{"+7", 7}, row{"-7", -7}, row{"007", 7}, row{"0x1f", 31},
          row{"-0x10", -16}, row{"+0xAb", 171}, row{"0x0", 0}, row{"0x7fffffffffffffff", max},
          row{"0x0123456789abcdEF", 0x0123456789abcdef}, row{"9223372036854775807", max},
          row{"-9223372036854775807", -max}})
        EXPECT_EQ(nrx::parse_number(argument, "bad"), value) << argument;
}

TEST(parse_number, rejects_an_invalid_number_with_message_and_argument) {
    for (const std::string& argument :
         split(",12a,a,-,+,--5,+-5,- 5, 5,5 ,1.5,0x,-0x,0X1f,0x1g,0x-1,0x+1,0x 1,x1,5:,5/,0x5G,"
               "0x5@,0x5`,9223372036854775808,-9223372036854775808,0x8000000000000000,"
               "0x10000000000000000",
               ',')) {
        const auto refused = capture([&] { nrx::parse_number(argument, "duration is invalid"); });
        EXPECT_EQ(refused.status, 1) << argument;
        EXPECT_EQ(refused.out, "duration is invalid (" + argument + ")\n");
        EXPECT_EQ(refused.err, "");
    }
}

TEST(parse_number, with_a_maximum_rejects_numbers_out_of_range) {
    EXPECT_EQ(nrx::parse_number_up_to(200, "-0", "bad"), 0U);
    EXPECT_EQ(nrx::parse_number_up_to(200, "200", "bad"), 200U);
    for (const std::string argument : {"-1", "201", "4294967296"})
        EXPECT_EQ(capture([&] { nrx::parse_number_up_to(200, argument, "bad"); }).out,
                  "bad (" + argument + ")\n");
}

struct packed {
    int position;
    std::vector<std::uint8_t> payload;

    bool operator==(const packed&) const = default;
};

packed pack(std::vector<std::string> arguments, int position = 0) {
    const argument_vector command_line(std::move(arguments));
    packed result{position, {0xee}};
    nrx::parse_payload(command_line.span(), result.position, result.payload);
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

TEST(parse_payload, starts_at_the_position_and_reads_a_width_only_there) {
    EXPECT_EQ(pack({"--command", "x", "u16", "1"}, 2), (packed{4, {1, 0}}));
    EXPECT_EQ(pack({"a"}, 1), (packed{1, {}}));
    EXPECT_EQ(pack({"a"}, 7), (packed{7, {}}));
    EXPECT_EQ(capture([] { pack({"1", "u16"}); }).out, "payload value is invalid (u16)\n");
}

TEST(parse_payload, rejects_values_beyond_the_width_or_32_bits) {
    rows<std::vector<std::string>, std::string> cases{
        {{"1ff"}, "Value 511 (01ff) is bigger than allowed (255, 0xff)\n"},
        {{"100"}, "Value 256 (0100) is bigger than allowed (255, 0xff)\n"},
        {{"u16", "1", "10000"}, "Value 65536 (010000) is bigger than allowed (65535, 0xffff)\n"},
        {{"0d-5"}, "Value -5 (0fffffffffffffffb) is bigger than allowed (255, 0xff)\n"},
        {{"u16", "u8", "1"}, "payload value is invalid (u8)\n"},
        {{"u32", "0d-1"},
         "Value -1 (0ffffffffffffffff) is bigger than allowed (4294967295, 0xffffffff)\n"},
    };
    for (const std::string argument :
         {"", "xyz", "0d", "0dff", "0d1.5", "0x", "0x-5", "1 2", "80000000", "0d2147483648",
          "0d-2147483649", "0d--1", "123456789012345678901"})
        cases.push_back({{"u32", argument}, "payload value is invalid (" + argument + ")\n"});
    for (const auto& [arguments, message] : cases) {
        const auto refused = capture([&values = arguments] { pack(values); });
        EXPECT_EQ(refused.status, 1);
        EXPECT_EQ(refused.out, message);
    }
}

}  // namespace

}  // namespace tests
