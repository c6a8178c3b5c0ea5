#include "platform/return_code.h"

#include <set>

#include <gtest/gtest.h>

#include "platform/virtual/return_codes.h"

namespace {

TEST(return_code, every_known_code_has_a_text_of_its_own) {
    const std::string_view unknown = platform::return_code_text(12345);
    EXPECT_FALSE(unknown.empty());
    std::set<std::string_view> texts{unknown};
    for (const auto code :
         {platform::success, platform::no_memory, platform::bad_argument, platform::unsupported,
          platform::not_found, platform::simulated::io_failure, platform::simulated::no_room,
          platform::simulated::not_ready}) {
        const std::string_view text = platform::return_code_text(code);
        EXPECT_FALSE(text.empty());
        EXPECT_TRUE(texts.insert(text).second) << text;
    }
}

}  // namespace
