#include "nrxctl/base/explanation.h"

#include <array>

#include <gtest/gtest.h>

#include "tests/support/rows.h"

namespace tests {

TEST(explanation, is_composed_for_a_listener_alone_and_kept_once) {
    nrx::explain([]() -> nrx::explanation {
        ADD_FAILURE();
        return {};
    });
    nrx::explanation_list outer;
    nrx::explain([] { return nrx::explanation{"a"}; });
    {
        nrx::explanation_list inner;
        nrx::explain([] { return nrx::explanation{"b", "c"}; });
        nrx::explain([] { return nrx::explanation{"b", "c"}; });
        EXPECT_EQ(inner.take(), std::vector<std::string>{"b; c"});
        EXPECT_EQ(inner.take(), std::vector<std::string>());
    }
    nrx::explain([] { return nrx::explanation{"d"}; });
    EXPECT_EQ(outer.take(), (std::vector<std::string>{"a", "d"}));
}

TEST(explanation, passes_the_scopes_from_the_inside_out) {
    nrx::explanation_list list;
    const nrx::explanation_scope outer(
        [](nrx::explanation& given) { given.problem += " outside"; });
    {
        const nrx::explanation_scope inner([](nrx::explanation& given) {
            given = {"inside", "x"};
        });
        nrx::explain([] { return nrx::explanation{"a"}; });
    }
    nrx::explain([] { return nrx::explanation{"b"}; });
    EXPECT_EQ(list.take(), (std::vector<std::string>{"inside outside; x", "b outside"}));
}

// At most 1 + length / 3 characters differ, and at least one is the same.
TEST(similar_keyword, has_the_smallest_distance) {
    constexpr std::array<std::string_view, 6> keywords{"accel", "gyro",  "compass",
                                                       "als",   "alias", "ab"};
    for (const auto& [argument, similar] : rows<std::string_view, std::string_view>{
             {"acel", "accel"},
             {"accele", "accel"},
             {"axxel", "accel"},
             {"axxxl", ""},
             {"compasssss", "compass"},
             {"kompassen", "compass"},
             {"gyroscope", ""},
             {"alsa", "als"},  // the first of two at the same distance
             {"aliaa", "alias"},
             {"x", ""},
             {"a", "ab"},
             {"", ""},
         })
        EXPECT_EQ(nrx::most_similar(argument, keywords), similar) << argument;
}

}  // namespace tests
