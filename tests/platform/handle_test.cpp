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

TEST(handle, gives_its_object_back_once_at_its_end_or_when_reset) {
    released.clear();
    {
        counted none;
        EXPECT_FALSE(none);
        none.reset();
        const counted kept(7);
        EXPECT_TRUE(kept);
        EXPECT_EQ(kept.id(), 7U);
        counted early(8);
        early.reset();
        early.reset();
        EXPECT_FALSE(early);
        EXPECT_EQ(released, id_list{8});
    }
    EXPECT_EQ(released, (id_list{8, 7}));
}

TEST(handle, moving_hands_the_object_over_and_releases_what_was_held) {
    released.clear();
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
        target = counted();
        EXPECT_EQ(released, (id_list{1, 2}));
    }
    EXPECT_EQ(released, (id_list{1, 2}));
}

}  // namespace
