#include "tests/support/fault_sweep.h"

#include <gtest/gtest.h>

namespace tests {

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
    const std::size_t calls = good_host->calls_made();
    ASSERT_GT(calls, 0U);
    for (std::size_t call = 1; call <= calls; ++call) {
        for (const auto how : platform::simulated::all_failures) {
            const auto host = make_host();
            const installed_machine installed(*host);
            host->record_calls();
            host->fail_call(call, how);
            const fault one{call, how, capture(operation)};
            const std::string where = "call " + std::to_string(call) + " (" +
                                      host->log().at(call - 1) + "), failure " +
                                      std::to_string(static_cast<int>(how));
            EXPECT_TRUE(acceptable(one)) << where << "\n" << one.result.out << one.result.err;
            EXPECT_EQ(host->open_handles(), 0U) << where;
        }
    }
}

}  // namespace tests
