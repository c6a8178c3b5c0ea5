#include "nrxctl/base/argument_words.h"

#include <array>
#include <string>

#include <gtest/gtest.h>

namespace tests {

TEST(argument_words, are_taken_in_order_and_the_parsers_index_goes_with_them) {
    std::array<std::string, 3> texts{"program", "one", ""};
    const std::array<char*, 3> words{texts[0].data(), texts[1].data(), texts[2].data()};
    int index = 1;
    nrx::argument_words left(words, index);
    EXPECT_EQ(left.take(), "one");
    EXPECT_EQ(index, 2);
    EXPECT_EQ(left.take(), "");
    EXPECT_EQ(left.take(), std::nullopt);
    EXPECT_EQ(index, 3);
}

TEST(argument_words, of_the_option_itself_come_first_and_move_nothing) {
    std::string one = "one";
    const std::array<char*, 1> words{one.data()};
    int index = 0;
    nrx::argument_words left(words, index);
    left.put_first("zero");
    EXPECT_EQ(left.take(), "zero");
    EXPECT_EQ(index, 0);
    EXPECT_EQ(left.take(), "one");
    left.put_first("again");
    EXPECT_EQ(left.take(), "again");
    EXPECT_EQ(left.take(), std::nullopt);
}

TEST(argument_words, end_where_an_index_outside_points) {
    std::string one = "one";
    const std::array<char*, 1> words{one.data()};
    for (int index : {-1, 1, 7}) {
        const int before = index;
        EXPECT_EQ(nrx::argument_words(words, index).take(), std::nullopt);
        EXPECT_EQ(index, before);
    }
}

}  // namespace tests
