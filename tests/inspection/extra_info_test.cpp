#include "nrxctl/inspection/extra_info.h"

#include "nrxctl/base/hex_dump.h"
#include "tests/inspection/sensor_host.h"

namespace tests {

namespace {

using namespace std::string_view_literals;
using nrx::number_base;

struct block_row {
    std::string_view block;
    std::string text;  // behind the label
    number_base after = number_base::decimal;
    std::size_t needed = 0;  // 0: nothing is missing
};

// From an allocation of its own size, so that a byte read beyond it is a sanitizer's find.
outcome print_block(std::string_view block, number_base& base) {
    const byte_list bytes = bytes_of(block);
    return capture([&] { nrx::print_info_block(bytes, base); });
}

void expect_rows(const std::vector<block_row>& rows, number_base before) {
    for (const block_row& row : rows) {
        number_base base = before;
        const outcome result = print_block(row.block, base);
        EXPECT_EQ(result.out, "ExtraInfo   : " + row.text + "\n");
        EXPECT_EQ(result.err, row.needed == 0 ? "" : too_short(row.needed, "extra_info.cpp"))
            << row.text;
        EXPECT_EQ(base, row.after) << row.text;
    }
}

TEST(extra_info, items_follow_each_other_without_anything_between_them) {
    expect_rows(
        {
            {"", ""},
            {"\0\x80\xff\xff\xff"sv, "-128"},
            {"\0\xff\xff\xff\x7f\0\0\0\0\x80"sv, "2147483647-2147483648"},
            {"\1\xff\xff\xff\xff\xff\xff\xff\xff"sv, "-1"},
            {"\1\1\2\3\4\5\6\7\x08"sv, "578437695752307201"},
            {"\2\0"sv, ""},
            {"\2ab\0\2 c\0\0\7\0\0\0"sv, "ab c7"},
            {"\3"sv, "\nExtraInfo   : "},
            {"\3\3\2x\0"sv, "\nExtraInfo   : \nExtraInfo   : x"},
            {"\4\0\xff\xff\xff\xff\1\xfe\xff\xff\xff\xff\xff\xff\xff"sv, "fffffffffffffffffffffffe",
             number_base::hexadecimal},
            {"\4\0\x0a\0\0\0\5\0\x0a\0\0\0\4"sv, "a10", number_base::hexadecimal},
            {"\5\5"sv, ""},
        },
        number_base::decimal);
    expect_rows({{"\0\xff\0\0\0"sv, "ff", number_base::hexadecimal},
                 {"\1\xff\0\0\0\0\0\0\0\5\1\xff\0\0\0\0\0\0\0"sv, "ff255"}},
                number_base::hexadecimal);
}

TEST(extra_info, ends_with_the_block_whatever_the_last_item_lacks) {
    const std::string_view block = "\0\x0a\0\0\0\2ab\0\4\1\xff\0\0\0\0\0\0\0\3\5\0\x0b\0\0\0"sv;
    struct step {
        std::size_t length;  // from which on this is printed
        std::string text;
        number_base after = number_base::decimal;
        std::size_t needed = 0;
    };
    const std::vector<step> steps{
        {0, ""},
        {1, "", number_base::decimal, 5},
        {5, "10"},
        {7, "10a"},
        {8, "10ab"},
        {10, "10ab", number_base::hexadecimal},
        {11, "10ab", number_base::hexadecimal, 19},
        {19, "10abff", number_base::hexadecimal},
        {20, "10abff\nExtraInfo   : ", number_base::hexadecimal},
        {21, "10abff\nExtraInfo   : "},
        {22, "10abff\nExtraInfo   : ", number_base::decimal, 26},
        {26, "10abff\nExtraInfo   : 11"},
    };
    ASSERT_EQ(block.size(), steps.back().length);
    auto now = steps.begin();
    for (std::size_t length = 0; length <= block.size(); ++length) {
        if (now + 1 != steps.end() && now[1].length == length) ++now;
        expect_rows({{block.substr(0, length), now->text, now->after, now->needed}},
                    number_base::decimal);
    }
}

TEST(extra_info, every_other_tag_ends_the_block_with_a_dump_of_all_of_it) {
    for (int tag = 6; tag <= 255; ++tag) {
        number_base base = number_base::decimal;
        const std::string block =
            std::string("\2sixteen letters.\0\4\5"sv) + static_cast<char>(tag) + "\2thirteen more";
        const outcome result = print_block(block, base);
        const std::string dump = capture([&] { nrx::hex_dump(bytes_of(block)); }).out;
        EXPECT_EQ(result.out, "ExtraInfo   : sixteen letters.\ndata error\n" + dump + "\n");
        EXPECT_EQ(result.err, "");
    }
}

}  // namespace

}  // namespace tests
