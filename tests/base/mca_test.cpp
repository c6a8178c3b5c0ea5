#include "nrxctl/base/mca.h"

#include "tests/base/base_host.h"

namespace tests {

namespace {

using lines = std::vector<std::string>;

// Switches it; the heading comes whatever happens.
std::string switching(bool on, platform::return_code expected) {
    const auto result = capture([&] { EXPECT_EQ(nrx::switch_mca(on), expected); });
    EXPECT_EQ(result.out, on ? "Turning ON MCA\n" : "Turning OFF MCA\n");
    return result.err;
}

// A command that sets a mode: its first nine bytes are given, sixty zeros follow.
std::string mode_call(const std::string& first_bytes) {
    std::string zeros;
    for (int i = 0; i < 60; ++i)
        zeros += " 00";
    return "call mca 3 scalars [0x22] in [" + first_bytes + zeros + "] results 0 room 0";
}

struct direction {
    bool on;
    lines steps;
};

const std::string buffer_words =
    "00 00 00 00 00 00 00 00 00 00 00 00 80 00 00 00 00 00 00 00 00 20 00 00";

const std::vector<direction> directions{
    {true,
     {"call mca 3 scalars [0x20] in [01] results 0 room 0", mode_call("10 00 00 00 01 03 00 00 00"),
      mode_call("3c 00 00 00 01 01 00 00 00"), mode_call("80 00 00 00 01 03 00 00 00"),
      "call mca 1 scalars [0xd8] in [" + buffer_words + "] results 0 room 0",
      "call mca 1 scalars [0x16] in [10 27 00 00] results 0 room 0"}},
    {false,
     {"call mca 1 scalars [0x16] in [00 00 00 00] results 0 room 0",
      mode_call("10 00 00 00 01 00 00 00 00"), mode_call("3c 00 00 00 01 00 00 00 00"),
      mode_call("80 00 00 00 01 00 00 00 00"),
      "call mca 3 scalars [0x20] in [00] results 0 room 0"}}};

using mca = device_test;

TEST_F(mca, is_switched_in_steps_and_ends_at_the_one_that_fails_which_is_reported_twice) {
    put_base_services(host);
    const std::string twice = failed("base/command_channel.cpp", "kr == 0 ", io_text) +
                              failed("base/mca.cpp", "kr == 0 ", io_text);
    for (const auto& [on, steps] : directions) {
        auto made = static_cast<std::ptrdiff_t>(logged("call").size());
        const auto calls = [&] {
            const lines all = logged("call");
            lines further(all.begin() + made, all.end());
            made = static_cast<std::ptrdiff_t>(all.size());
            return further;
        };
        EXPECT_EQ(switching(on, platform::success), "");
        EXPECT_EQ(calls(), steps);
        for (std::size_t step = 1; step <= steps.size(); ++step) {
            // Finding and opening the service and calling it take four calls of the platform.
            host.fail_call(4 * step, failure::io);
            EXPECT_EQ(switching(on, platform::simulated::io_failure), twice) << step;
            EXPECT_EQ(calls().size(), step);
        }
    }
}

TEST_F(mca, missing_is_reported_twice_too) {
    for (const bool on : {true, false}) {
        EXPECT_EQ(switching(on, platform::not_found),
                  failed("base/channel.cpp", "service") +
                      failed("base/mca.cpp", "kr == 0 ", not_found_text));
    }
}

}  // namespace

}  // namespace tests
