#include "platform/property.h"

#include <limits>

#include <gtest/gtest.h>

namespace {

using platform::array;
using platform::describe;
using platform::dictionary;
using platform::property;
using platform::same_value;

constexpr std::int64_t largest = std::numeric_limits<std::int64_t>::max();

TEST(property, is_of_one_kind) {
    const std::vector<property> kinds{std::int32_t{-3}, largest, "name", array{1},
                                      dictionary{{"k", 1}}};
    for (std::size_t kind = 0; kind < kinds.size(); ++kind) {
        EXPECT_EQ(kinds[kind].number().has_value(), kind < 2) << kind;
        EXPECT_EQ(kinds[kind].text() != nullptr, kind == 2) << kind;
        EXPECT_EQ(kinds[kind].items() != nullptr, kind == 3) << kind;
        EXPECT_EQ(kinds[kind].entries() != nullptr, kind == 4) << kind;
    }
}

TEST(property, a_dictionary_keeps_each_key_once_in_the_order_first_set) {
    dictionary all{{"b", 1}, {"a", 2}, {"b", 3}};
    all.set("c", "x");
    all.set("a", "y");
    EXPECT_EQ(describe(all), R"({b = 3; a = "y"; c = "x"})");
    EXPECT_EQ(*all.find("c")->text(), "x");
    EXPECT_EQ(all.find("C"), nullptr);
    EXPECT_EQ(all.find(""), nullptr);
}

TEST(property, values_are_the_same_by_content_whatever_the_width_and_order) {
    const dictionary a_is_1{{"a", 1}};
    const std::vector<std::pair<property, property>> same{
        {std::int32_t{-1}, std::int64_t{-1}},
        {array{1, "x"}, array{std::int64_t{1}, "x"}},
        {dictionary{{"a", 1}, {"b", 2}}, dictionary{{"b", 2}, {"a", 1}}},
    };
    const std::vector<std::pair<property, property>> different{
        {std::int32_t{-1}, std::int64_t{0xffffffff}},
        {1, "1"},
        {"", array{}},
        {array{}, dictionary{}},
        {"abc", "abC"},
        {array{1, "x"}, array{"x", 1}},
        {array{1}, array{1, 2}},
        {a_is_1, dictionary{{"a", 1}, {"b", 2}}},
        {a_is_1, dictionary{{"a", 2}}},
        {a_is_1, dictionary{{"b", 1}}},
    };
    for (const auto& [one, other] : same)
        EXPECT_TRUE(same_value(one, other) && same_value(other, one)) << describe(one);
    for (const auto& [one, other] : different)
        EXPECT_FALSE(same_value(one, other) || same_value(other, one)) << describe(one);
}

TEST(property, is_described_on_one_line) {
    EXPECT_EQ(describe(-5), "-5");
    EXPECT_EQ(describe(largest), "9223372036854775807");
    EXPECT_EQ(describe("a\nb\x7f\xc3\xa4"), "\"a.b.\xc3\xa4\"");
    EXPECT_EQ(describe(array{}), "()");
    EXPECT_EQ(describe(dictionary{}), "{}");
    EXPECT_EQ(describe(array{1, array{2, 3}, dictionary{{"k", "v"}, {"n", array{}}}}),
              R"((1, (2, 3), {k = "v"; n = ()}))");
}

}  // namespace
