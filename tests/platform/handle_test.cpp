#include "platform/handle.h"

#include <utility>
#include <vector>

#include <gtest/gtest.h>

namespace {

std::vector<platform::handle_id> released;

struct counted_kind {
    static void release(platform::handle_id id) { released.push_back(id); }
};

using counted = platform::handle<counted_kind>;
using id_list = std::vector<platform::handle_id>;

class handle : public ::testing::Test {
protected:
    void SetUp() override { released.clear(); }
};

TEST_F(handle, none_is_nothing_to_release) {
    {
        counted none;
        EXPECT_FALSE(none);
        EXPECT_EQ(none.id(), 0U);
        none.reset();
        const counted moved = std::move(none);
        EXPECT_FALSE(moved);
    }
    EXPECT_EQ(released, id_list{});
}

TEST_F(handle, releases_once_at_its_end_or_when_reset) {
    {
        const counted kept(7);
        EXPECT_TRUE(kept);
        EXPECT_EQ(kept.id(), 7U);
        counted early(8);
        early.reset();
        EXPECT_FALSE(early);
        EXPECT_EQ(released, id_list{8});
        early.reset();
    }
    EXPECT_EQ(released, (id_list{8, 7}));
}

TEST_F(handle, moving_hands_the_object_over_and_releases_what_was_held) {
    {
        counted source(1);
        counted target(std::move(source));
        EXPECT_FALSE(source);  // NOLINT(bugprone-use-after-move): it holds none
        EXPECT_EQ(target.id(), 1U);
        target = counted(2);
        EXPECT_EQ(released, id_list{1});
        counted& same = target;
        target = std::move(same);
        EXPECT_EQ(target.id(), 2U);
        EXPECT_EQ(released, id_list{1});
        target = counted();
        EXPECT_EQ(released, (id_list{1, 2}));
    }
    EXPECT_EQ(released, (id_list{1, 2}));
}

}  // namespace
