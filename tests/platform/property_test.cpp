#include "platform/property.h"

#include <limits>

#include <gtest/gtest.h>

namespace {

using platform::array;
using platform::describe;
using platform::dictionary;
using platform::property;
using platform::same_value;

TEST(property, tells_its_kind) {
    const property narrow(std::int32_t{-3});
    const property wide(std::numeric_limits<std::int64_t>::min());
    const property text("name");
    const property items(array{1, "two"});
    const property entries(dictionary{{"k", 1}});
    EXPECT_EQ(narrow.number(), -3);
    EXPECT_EQ(wide.number(), std::numeric_limits<std::int64_t>::min());
    EXPECT_EQ(*text.text(), "name");
    EXPECT_EQ(items.items()->size(), 2U);
    EXPECT_EQ(entries.entries()->find("k")->number(), 1);
    for (const property* other : {&text, &items, &entries}) {
        EXPECT_EQ(other->number(), std::nullopt);
    }
    for (const property* other : {&narrow, &wide, &items, &entries}) {
        EXPECT_EQ(other->text(), nullptr);
    }
    for (const property* other : {&narrow, &wide, &text, &entries}) {
        EXPECT_EQ(other->items(), nullptr);
    }
    for (const property* other : {&narrow, &wide, &text, &items}) {
        EXPECT_EQ(other->entries(), nullptr);
    }
}

TEST(property, a_dictionary_keeps_each_key_once_in_the_order_first_set) {
    dictionary all{{"b", 1}, {"a", 2}, {"b", 3}};
    all.set("c", "x");
    all.set("a", "y");
    EXPECT_EQ(describe(all), R"({b = 3; a = "y"; c = "x"})");
    EXPECT_EQ(all.entries().size(), 3U);
    EXPECT_EQ(*all.find("c")->text(), "x");
    EXPECT_EQ(all.find("C"), nullptr);
    EXPECT_EQ(all.find(""), nullptr);
    EXPECT_EQ(dictionary().find("a"), nullptr);
}

TEST(property, a_copy_shares_nothing_with_its_source) {
    dictionary source{{"inner", dictionary{{"k", array{1, 2}}}}, {"n", 5}};
    const dictionary copied = source;
    dictionary assigned;
    assigned = source;
    source.set("inner", 0);
    source.set("n", 6);
    for (const dictionary* copy : {&copied, static_cast<const dictionary*>(&assigned)}) {
        EXPECT_EQ(describe(*copy), "{inner = {k = (1, 2)}; n = 5}");
    }
    const dictionary moved = std::move(assigned);
    EXPECT_EQ(describe(moved), "{inner = {k = (1, 2)}; n = 5}");
}

TEST(property, numbers_are_the_same_whatever_their_width) {
    EXPECT_TRUE(same_value(std::int32_t{-1}, std::int64_t{-1}));
    EXPECT_FALSE(same_value(std::int32_t{-1}, std::int64_t{0xffffffff}));
    EXPECT_FALSE(same_value(1, "1"));
    EXPECT_FALSE(same_value(0, array{}));
    EXPECT_FALSE(same_value("", array{}));
    EXPECT_FALSE(same_value(array{}, dictionary{}));
}

TEST(property, texts_arrays_and_dictionaries_are_the_same_by_content) {
    EXPECT_TRUE(same_value("abc", std::string("abc")));
    EXPECT_FALSE(same_value("abc", "abC"));
    EXPECT_TRUE(same_value(array{1, "x"}, array{std::int64_t{1}, "x"}));
    EXPECT_FALSE(same_value(array{1, "x"}, array{"x", 1}));
    EXPECT_FALSE(same_value(array{1}, array{1, 2}));
    EXPECT_TRUE(same_value(dictionary{{"a", 1}, {"b", 2}}, dictionary{{"b", 2}, {"a", 1}}));
    EXPECT_FALSE(same_value(dictionary{{"a", 1}}, dictionary{{"a", 1}, {"b", 2}}));
    EXPECT_FALSE(same_value(dictionary{{"a", 1}, {"b", 2}}, dictionary{{"a", 1}}));
    EXPECT_FALSE(same_value(dictionary{{"a", 1}}, dictionary{{"a", 2}}));
    EXPECT_FALSE(same_value(dictionary{{"a", 1}}, dictionary{{"b", 1}}));
}

TEST(property, is_described_on_one_line) {
    EXPECT_EQ(describe(-5), "-5");
    EXPECT_EQ(describe(std::numeric_limits<std::int64_t>::max()), "9223372036854775807");
    EXPECT_EQ(describe("a\nb\x7f\xc3\xa4"), "\"a.b.\xc3\xa4\"");
    EXPECT_EQ(describe(array{}), "()");
    EXPECT_EQ(describe(dictionary{}), "{}");
    EXPECT_EQ(describe(array{1, array{2, 3}, dictionary{{"k", "v"}, {"n", array{}}}}),
              R"((1, (2, 3), {k = "v"; n = ()}))");
}

}  // namespace
