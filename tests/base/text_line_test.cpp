#include "nrxctl/base/text_line.h"

#include <cstdint>
#include <limits>

#include <gtest/gtest.h>

namespace {

using nrx::text_line;

TEST(text_line, pads_and_never_cuts) {
    text_line line;
    line.left("ab", 4).text("|").right("ab", 4).text("|").left("abcde", 4).right("abcde", 4);
    EXPECT_EQ(line.view(), "ab  |  ab|abcdeabcde");
    line.clear();
    line.number(-7, 4).text("|").number(12345, 4).text("|").hex(0x1f, 4);
    EXPECT_EQ(line.view(), "  -7|12345|  1f");
    line.clear();
    line.zero_padded_hex(0x1f, 4).text("|").zero_padded_hex(0x12345, 4);
    EXPECT_EQ(line.view(), "001f|12345");
}

TEST(text_line, writes_numbers_to_their_limits) {
    text_line line;
    line.number(std::numeric_limits<std::int64_t>::min()).text(" ");
    line.number(std::numeric_limits<std::uint64_t>::max()).text(" ");
    line.number(std::uint8_t{200}).text(" ").hex(std::numeric_limits<std::uint64_t>::max());
    EXPECT_EQ(line.view(), "-9223372036854775808 18446744073709551615 200 ffffffffffffffff");
}

TEST(text_line, writes_fractions_as_printf_does) {
    text_line line;
    line.general(25.6).text(" ").general(-1.0).text(" ").general(1234567.0).text(" ");
    line.general(0.00001220703125).text(" ").general(0.1F).text(" ");
    line.fixed(-0.5, 6).text(" ").fixed(100, 2);
    EXPECT_EQ(line.view(), "25.6 -1 1.23457e+06 1.2207e-05 0.1 -0.500000 100.00");
}

}  // namespace
