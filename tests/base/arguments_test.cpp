#include "nrxctl/base/arguments.h"

#include <gtest/gtest.h>

#include "tests/support/argument_vector.h"

namespace tests {

TEST(argument_cursor, reads_in_order_and_advances_the_index) {
    const argument_vector arguments({"program", "one", ""});
    int index = 1;
    nrx::argument_cursor cursor(arguments.span(), index);
    EXPECT_EQ(cursor.next(), "one");
    EXPECT_EQ(index, 2);
    // The option's own argument comes first and does not move the index.
    cursor.prepend("zero");
    EXPECT_EQ(cursor.remaining(), 2U);
    EXPECT_EQ(cursor.next(), "zero");
    EXPECT_EQ(cursor.remaining(), 1U);
    EXPECT_EQ(index, 2);
    EXPECT_EQ(cursor.next(), "");
    EXPECT_EQ(cursor.next(), std::nullopt);
    EXPECT_EQ(index, 3);
    cursor.prepend("again");
    EXPECT_EQ(cursor.next(), "again");
    EXPECT_EQ(cursor.next(), std::nullopt);
}

TEST(argument_cursor, index_outside_the_arguments_is_the_end) {
    const argument_vector arguments({"one"});
    for (int index : {-1, 1, 7}) {
        const int before = index;
        nrx::argument_cursor cursor(arguments.span(), index);
        EXPECT_EQ(cursor.remaining(), 0U);
        EXPECT_EQ(cursor.next(), std::nullopt);
        EXPECT_EQ(index, before);
    }
}

}  // namespace tests
