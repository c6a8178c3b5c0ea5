#include "nrxctl/base/argument_words.h"

#include <gtest/gtest.h>

#include "tests/support/word_vector.h"

namespace tests {

TEST(argument_words, are_taken_in_order_and_the_parsers_index_goes_with_them) {
    const word_vector words({"program", "one", ""});
    int index = 1;
    nrx::argument_words left(words.all(), index);
    EXPECT_EQ(left.take(), "one");
    EXPECT_EQ(index, 2);
    // A word of the option itself comes first and moves nothing.
    left.put_first("zero");
    EXPECT_EQ(left.left(), 2U);
    EXPECT_EQ(left.take(), "zero");
    EXPECT_EQ(left.left(), 1U);
    EXPECT_EQ(index, 2);
    EXPECT_EQ(left.take(), "");
    EXPECT_EQ(left.take(), std::nullopt);
    EXPECT_EQ(index, 3);
    left.put_first("again");
    EXPECT_EQ(left.take(), "again");
    EXPECT_EQ(left.take(), std::nullopt);
}

TEST(argument_words, end_where_an_index_outside_points) {
    const word_vector words({"one"});
    for (int index : {-1, 1, 7}) {
        const int before = index;
        nrx::argument_words left(words.all(), index);
        EXPECT_EQ(left.left(), 0U);
        EXPECT_EQ(left.take(), std::nullopt);
        EXPECT_EQ(index, before);
    }
}

}  // namespace tests
