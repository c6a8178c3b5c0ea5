#include "nrxctl/base/mca.h"

#include "tests/base/base_host.h"
#include "tests/support/argument_vector.h"

namespace tests {

namespace {

// Switches the MCA and checks the heading. Returns the failure reports.
std::string switch_mca(bool on, platform::return_code expected) {
    const auto result = capture([&] { EXPECT_EQ(nrx::switch_mca(on), expected); });
    EXPECT_EQ(result.out, on ? "Turning ON MCA\n" : "Turning OFF MCA\n");
    return result.err;
}

// A command that sets a mode: nine bytes, then sixty zeros.
std::string mode_call(const std::string& first_bytes) {
    std::string zeros;
    for (int i = 0; i < 60; ++i)
        zeros += " 00";
    return "call mca 3 scalars [0x22] in [" + first_bytes + zeros + "] results 0 capacity 0";
}

struct sequence {
    bool on;
    lines steps;
};

const std::string buffer_bytes =
    "00 00 00 00 00 00 00 00 00 00 00 00 80 00 00 00 00 00 00 00 00 20 00 00";

const std::vector<sequence> sequences{
    {true,
     {"call mca 3 scalars [0x20] in [01] results 0 capacity 0",
      mode_call("10 00 00 00 01 03 00 00 00"), mode_call("3c 00 00 00 01 01 00 00 00"),
      mode_call("80 00 00 00 01 03 00 00 00"),
      "call mca 1 scalars [0xd8] in [" + buffer_bytes + "] results 0 capacity 0",
      "call mca 1 scalars [0x16] in [10 27 00 00] results 0 capacity 0"}},
    {false,
     {"call mca 1 scalars [0x16] in [00 00 00 00] results 0 capacity 0",
      mode_call("10 00 00 00 01 00 00 00 00"), mode_call("3c 00 00 00 01 00 00 00 00"),
      mode_call("80 00 00 00 01 00 00 00 00"),
      "call mca 3 scalars [0x20] in [00] results 0 capacity 0"}}};

using mca = device_test;

TEST_F(mca, first_failed_step_ends_the_sequence_and_is_reported_reports) {
    add_base_services(host);
    const std::string reports = library_report(source_file::command_channel, "kr == 0 ", io_text) +
                                library_report(source_file::mca, "kr == 0 ", io_text);
    for (const auto& [on, steps] : sequences) {
        auto seen = static_cast<std::ptrdiff_t>(logged_calls("call").size());
        const auto calls = [&] {
            const lines calls_so_far = logged_calls("call");
            lines added(calls_so_far.begin() + seen, calls_so_far.end());
            seen = static_cast<std::ptrdiff_t>(calls_so_far.size());
            return added;
        };
        EXPECT_EQ(switch_mca(on, platform::success), "");
        EXPECT_EQ(calls(), steps);
        for (std::size_t step = 1; step <= steps.size(); ++step) {
            // Each step makes four platform calls: two lookups, an open, a call.
            host.fail_call(4 * step, failure::io);
            EXPECT_EQ(switch_mca(on, platform::simulated::io_failure), reports) << step;
            EXPECT_EQ(calls().size(), step);
        }
    }
}

}  // namespace

}  // namespace tests
