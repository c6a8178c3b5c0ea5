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

TEST(handle, gives_its_object_back_once_when_reset_replaced_or_gone_and_not_when_moved) {
    {
        counted none;
        EXPECT_FALSE(none);
        none.reset();
        counted source(1);
        EXPECT_TRUE(source);
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
        counted early(3);
        early.reset();
        early.reset();
        const counted kept(4);
        EXPECT_EQ(released, (id_list{1, 2, 3}));
    }
    EXPECT_EQ(released, (id_list{1, 2, 3, 4}));
}

}  // namespace
