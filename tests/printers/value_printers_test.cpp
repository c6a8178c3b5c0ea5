#include "nrxctl/printers/value_printers.h"

#include <gtest/gtest.h>

#include "tests/support/report_bytes.h"

namespace {

using namespace tests;

std::string text_or_dump(const std::vector<std::uint8_t>& report) {
    return printed(nrx::print_text_or_dump, "x", 1, report).out;
}

TEST(value_printers, text_or_dump_looks_at_every_byte_but_the_last) {
    EXPECT_EQ(text_or_dump({'o', 'k', 0}), std::string("ok\0\n", 4));
    EXPECT_EQ(text_or_dump({' ', '\t', '\n', '\v', '\f', '\r', '~', 0xff}), " \t\n\v\f\r~\xff\n");
    EXPECT_EQ(text_or_dump({0}), std::string("\0\n", 2));
    EXPECT_EQ(text_or_dump({}), "");
    EXPECT_EQ(text_or_dump({0, 'k'}),
              "00000000: 00 6b                                             | .k\n");
    for (const int byte : {0x08, 0x0e, 0x1f, 0x7f, 0x80, 0xff}) {
        EXPECT_EQ(text_or_dump({static_cast<std::uint8_t>(byte), 'a'}).substr(0, 10), "00000000: ")
            << byte;
    }
}

TEST(value_printers, print_their_bytes_and_nothing_else) {
    EXPECT_EQ(printed(nrx::print_hex, "x", 1, {'a'}).out,
              "00000000: 61                                                | a\n");
    EXPECT_EQ(printed(nrx::print_text, "x", 1, {'a', 0, 0xff}).out, std::string("a\0\xff\n", 4));
    EXPECT_EQ(printed(nrx::print_text, "x", 1, {}).out, "\n");
    EXPECT_EQ(printed(nrx::print_raw, "x", 1, {'a', 0, '\n'}).out, std::string("a\0\n", 3));
    EXPECT_EQ(printed(nrx::print_raw, "x", 1, {}).out, "");
}

TEST(value_printers, u32_reads_up_to_four_bytes) {
    EXPECT_EQ(printed(nrx::print_u32, "x", 1, {0xff, 0xff, 0xff, 0xff}).out, "4294967295\n");
    EXPECT_EQ(printed(nrx::print_u32, "x", 1, {1, 2}).out, "513\n");
    EXPECT_EQ(printed(nrx::print_u32, "x", 1, {}).out, "0\n");
    EXPECT_EQ(printed(nrx::print_u32, "x", 1, {1, 2, 3, 4, 5}).out, "");
}

}  // namespace
