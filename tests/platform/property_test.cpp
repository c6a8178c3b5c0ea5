#include "platform/property.h"

#include <gtest/gtest.h>

#include "tests/support/rows.h"

namespace tests {

using platform::array;
using platform::describe;
using platform::dictionary;
using platform::property;

TEST(property, dictionary_keeps_keys_in_the_order_first_set) {
    dictionary all{{"b", 1}, {"a", 2}, {"b", 3}};
    all.set("c", "x");
    all.set("a", "y");
    EXPECT_EQ(describe(all), R"({b = 3; a = "y"; c = "x"})");
    EXPECT_EQ(*all.find("c")->text(), "x");
    EXPECT_EQ(all.find("C"), nullptr);
}

TEST(property, compares_by_content) {
    const dictionary a1{{"a", 1}};
    using row = std::tuple<property, property, bool>;
    for (const auto& [a, b, equal] :
         {row{-1, std::int64_t{-1}, true}, row{array{1, "x"}, array{std::int64_t{1}, "x"}, true},
          row{dictionary{{"a", 1}, {"b", 2}}, dictionary{{"b", 2}, {"a", 1}}, true},
          row{-1, std::int64_t{0xffffffff}, false}, row{1, "1", false}, row{"", array{}, false},
          row{array{}, dictionary{}, false}, row{"abc", "abC", false},
          row{array{1, "x"}, array{"x", 1}, false}, row{array{1}, array{1, 2}, false},
          row{a1, dictionary{{"a", 1}, {"b", 2}}, false}, row{a1, dictionary{{"a", 2}}, false},
          row{a1, dictionary{{"b", 1}}, false}})
        EXPECT_TRUE(same_value(a, b) == equal && same_value(b, a) == equal) << describe(a);
}

}  // namespace tests
