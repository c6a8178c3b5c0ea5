#include "platform/return_code.h"

#include <set>

#include <gtest/gtest.h>

#include "platform/virtual/failure.h"

namespace {

TEST(return_code, is_written_as_its_bit_pattern) {
    EXPECT_EQ(platform::success, 0);
    EXPECT_EQ(platform::no_memory, -536870211);
    EXPECT_EQ(platform::bad_argument, -536870206);
    EXPECT_EQ(platform::unsupported, -536870201);
    EXPECT_EQ(platform::not_found, -536870160);
}

TEST(return_code, every_known_code_has_a_text_of_its_own) {
    const std::string_view unknown = platform::return_code_text(12345);
    EXPECT_FALSE(unknown.empty());
    std::set<std::string_view> texts{unknown};
    for (const auto code :
         {platform::success, platform::no_memory, platform::bad_argument, platform::unsupported,
          platform::not_found, platform::simulated::io_failure, platform::simulated::no_room}) {
        const std::string_view text = platform::return_code_text(code);
        EXPECT_FALSE(text.empty());
        EXPECT_TRUE(texts.insert(text).second) << text;
    }
}

TEST(return_code, every_way_to_fail_has_the_code_of_its_name) {
    using platform::simulated::code_of;
    using platform::simulated::failure;
    EXPECT_EQ(code_of(failure::io), platform::simulated::io_failure);
    EXPECT_EQ(code_of(failure::unsupported), platform::unsupported);
    EXPECT_EQ(code_of(failure::not_found), platform::not_found);
    EXPECT_EQ(code_of(failure::no_memory), platform::no_memory);
    EXPECT_EQ(code_of(failure::nothing), platform::success);
}

}  // namespace
