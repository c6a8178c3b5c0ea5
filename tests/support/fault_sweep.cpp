#include "tests/support/fault_sweep.h"

#include <gtest/gtest.h>

#include "platform/virtual/current_machine.h"

namespace tests {

using platform::simulated::failure;
using platform::simulated::installed_machine;
using platform::simulated::machine;

void sweep_faults(const std::function<std::unique_ptr<machine>()>& make_host,
                  const std::function<void()>& operation,
                  const std::function<bool(const fault&)>& acceptable) {
    const auto good_host = make_host();
    {
        const installed_machine installed(*good_host);
        capture(operation);
    }
    EXPECT_EQ(good_host->open_handles(), 0U) << "in the good run";
    const std::size_t calls = good_host->calls_made();
    ASSERT_GT(calls, 0U);
    for (std::size_t call = 1; call <= calls; ++call) {
        for (const auto how : platform::simulated::all_failures) {
            const auto host = make_host();
            const installed_machine installed(*host);
            host->record_calls();
            host->fail_call(call, how);
            std::string name;
            host->before_call(call, [&] { name = host->log().back(); });
            const outcome result = capture(operation);
            const fault one{call, name, how, result};
            const std::string where = "call " + std::to_string(call) + " (" + name +
                                      "), which fails with " +
                                      std::string(platform::return_code_text(code_of(how)));
            EXPECT_FALSE(name.empty()) << "call " << call << " was not made a second time";
            EXPECT_TRUE(acceptable(one)) << where << "\n" << one.result.out << one.result.err;
            EXPECT_EQ(host->open_handles(), 0U) << where;
        }
    }
}

bool is_told(const fault& one) {
    const bool tells_nothing_new = one.name.find("IONameMatch = \"WQR_") != std::string::npos;
    const bool is_a_reply = one.name.starts_with("call ") || one.name.starts_with("feature report");
    return tells_nothing_new || (is_a_reply && one.how == failure::nothing) ||
           !one.result.err.empty();
}

}  // namespace tests
