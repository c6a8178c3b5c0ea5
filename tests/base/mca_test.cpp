#include "nrxctl/base/mca.h"

#include "tests/support/device_test.h"

namespace {

using tests::byte_list;
using tests::capture;
using tests::failure;
using tests::failure_line;
using lines = std::vector<std::string>;

constexpr const char* source = "nrxctl/base/mca.cpp";

class mca : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        auto& service = tests::put_service(host, "mca", 33);
        for (const std::uint32_t command : {0x20U, 0x22U}) {
            service.set_command(command,
                                [](platform::byte_view, byte_list&) { return platform::success; });
        }
        service.set_report(0x16, {});
        service.set_report(0xd8, {});
    }
};

// A command that sets a mode: its first nine bytes are given, sixty zeros follow.
std::string mode_call(const std::string& first_bytes) {
    std::string zeros;
    for (int i = 0; i < 60; ++i)
        zeros += " 00";
    return "call mca 3 scalars [0x22] in [" + first_bytes + zeros + "] results 0 room 0";
}

TEST_F(mca, is_switched_on_in_six_steps) {
    const std::string buffer_words =
        "00 00 00 00 00 00 00 00 00 00 00 00 80 00 00 00 00 00 00 00 00 20 00 00";
    const auto result = capture([] { EXPECT_EQ(nrx::switch_mca(true), platform::success); });
    EXPECT_EQ(result.out, "Turning ON MCA\n");
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(
        logged("call"),
        (lines{"call mca 3 scalars [0x20] in [01] results 0 room 0",
               mode_call("10 00 00 00 01 03 00 00 00"), mode_call("3c 00 00 00 01 01 00 00 00"),
               mode_call("80 00 00 00 01 03 00 00 00"),
               "call mca 1 scalars [0xd8] in [" + buffer_words + "] results 0 room 0",
               "call mca 1 scalars [0x16] in [10 27 00 00] results 0 room 0"}));
}

TEST_F(mca, is_switched_off_in_five) {
    const auto result = capture([] { EXPECT_EQ(nrx::switch_mca(false), platform::success); });
    EXPECT_EQ(result.out, "Turning OFF MCA\n");
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(logged("call"), (lines{"call mca 1 scalars [0x16] in [00 00 00 00] results 0 room 0",
                                     mode_call("10 00 00 00 01 00 00 00 00"),
                                     mode_call("3c 00 00 00 01 00 00 00 00"),
                                     mode_call("80 00 00 00 01 00 00 00 00"),
                                     "call mca 3 scalars [0x20] in [00] results 0 room 0"}));
}

// Finding and opening the service and calling it take four calls of the platform.
TEST_F(mca, ends_at_the_step_that_fails_which_is_reported_twice) {
    const std::string code = "device i/o failure (0xe0000401)";
    const std::string channel = "nrxctl/base/command_channel.cpp";
    const std::string reported = failure_line("nrxtoollib", "kr == 0 ", channel, code) +
                                 failure_line("nrxtoollib", "kr == 0 ", source, code);
    for (const bool on : {true, false}) {
        const std::size_t steps = on ? 6 : 5;
        for (std::size_t step = 1; step <= steps; ++step) {
            const std::size_t made = logged("call").size();
            host.fail_call(4 * step, failure::io);
            const auto result =
                capture([&] { EXPECT_EQ(nrx::switch_mca(on), platform::simulated::io_failure); });
            EXPECT_EQ(result.err, reported) << step;
            EXPECT_EQ(logged("call").size(), made + step);
        }
    }
}

TEST_F(mca, missing_is_reported_twice_too) {
    host.remove("mca");
    for (const bool on : {true, false}) {
        const auto result = capture([&] { EXPECT_EQ(nrx::switch_mca(on), platform::not_found); });
        EXPECT_EQ(result.err, failure_line("nrxtoollib", "service", "nrxctl/base/channel.cpp") +
                                  failure_line("nrxtoollib", "kr == 0 ", source,
                                               "service not found (0xe00002f0)"));
    }
}

}  // namespace
