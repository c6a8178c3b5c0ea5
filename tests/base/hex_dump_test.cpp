#include "nrxctl/base/hex_dump.h"

#include <numeric>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/capture.h"

namespace {

std::string dump(const std::vector<std::uint8_t>& bytes, std::string_view label = {}) {
    return tests::capture([&] { nrx::hex_dump(bytes, label); }).out;
}

TEST(hex_dump, sixteen_bytes_to_a_line_in_fixed_columns) {
    EXPECT_EQ(dump({}, "payload"), "");
    EXPECT_EQ(dump({0x41, 0x20, 0x80}),
              "00000000: 41 20 80                                          | A..\n");
    EXPECT_EQ(dump({1, 2, 3, 4, 5, 6, 7, 0x7e}),
              "00000000: 01 02 03 04 05 06 07 7e                           | .......~ \n");
    EXPECT_EQ(dump({'a', 'b', 'c', 'd', 'e', 'f', 'g', 'h', 'i'}),
              "00000000: 61 62 63 64 65 66 67 68  69                       | abcdefgh i\n");
    std::vector<std::uint8_t> bytes(17);
    std::iota(bytes.begin(), bytes.end(), std::uint8_t{0x1c});
    EXPECT_EQ(dump(bytes, "payload"),
              "payload 00000000: 1c 1d 1e 1f 20 21 22 23  24 25 26 27 28 29 2a 2b  | .....!\"# "
              "$%&'()*+\n"
              "payload 00000010: 2c                                                | ,\n");
}

TEST(hex_dump, characters_that_are_not_printable_are_dots) {
    std::vector<std::uint8_t> bytes(256);
    std::iota(bytes.begin(), bytes.end(), std::uint8_t{0});
    const std::string text = dump(bytes);
    std::string characters;
    for (std::size_t line = 0; line < 16; ++line) {
        const std::string row = text.substr(line * 80, 79);
        EXPECT_EQ(row.substr(59, 3), " | ");
        characters += row.substr(62, 8) + row.substr(71, 8);
    }
    EXPECT_EQ(text.substr(15 * 80, 10), "000000f0: ");
    EXPECT_EQ(characters, std::string(33, '.') +
                              "!\"#$%&'()*+,-./0123456789:;<=>?@ABCDEFGHIJKLMNOPQRSTUVWXYZ[\\]^_`"
                              "abcdefghijklmnopqrstuvwxyz{|}~" +
                              std::string(129, '.'));
}

TEST(hex_dump, long_label_is_cut_to_fit_256_characters) {
    const std::string text = dump(std::vector<std::uint8_t>(16, 'x'), std::string(300, 'L'));
    EXPECT_EQ(text.size(), 256U);
    EXPECT_EQ(text, std::string(175, 'L') +
                        " 00000000: 78 78 78 78 78 78 78 78  78 78 78 78 78 78 78 78  | xxxxxxxx "
                        "xxxxxxxx\n");
}

}  // namespace
