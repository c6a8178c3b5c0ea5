#include "tests/support/fault_sweep.h"

#include <regex>

#include <gtest/gtest.h>

#include "platform/virtual/current_machine.h"

namespace tests {

using platform::simulated::failure;
using platform::simulated::installed_machine;
using platform::simulated::machine;

void sweep_faults(const std::function<std::unique_ptr<machine>()>& make_host,
                  const std::function<void()>& operation,
                  const std::function<bool(const fault&)>& acceptable) {
    const auto reference_host = make_host();
    {
        const installed_machine installed(*reference_host);
        capture(operation);
    }
    EXPECT_EQ(reference_host->open_handles(), 0U) << "in the successful run";
    const std::size_t calls = reference_host->calls_made();
    ASSERT_GT(calls, 0U);
    for (std::size_t call = 1; call <= calls; ++call) {
        for (const auto kind : platform::simulated::all_failures) {
            const auto host = make_host();
            const installed_machine installed(*host);
            host->record_calls();
            host->fail_call(call, kind);
            std::string name;
            host->before_call(call, [&] { name = host->log().back(); });
            const outcome result = capture(operation);
            const fault fault{call, name, kind, result};
            const std::string description = "call " + std::to_string(call) + " (" + name +
                                            "), which fails with " +
                                            std::string(platform::return_code_text(code_of(kind)));
            EXPECT_FALSE(name.empty()) << "call " << call << " was not made a second time";
            EXPECT_TRUE(acceptable(fault)) << description << "\n"
                                           << fault.result.out << fault.result.err;
            EXPECT_EQ(host->open_handles(), 0U) << description;
        }
    }
}

void sweep_faults(const std::function<std::unique_ptr<machine>()>& make_host,
                  const std::vector<sweep_row>& rows) {
    for (const sweep_row& row : rows) {
        sweep_faults(make_host, row.operation, [&](const fault& fault) {
            return !fault.result.err.empty() || fault.kind == failure::empty_result ||
                   std::regex_search(fault.name, std::regex(row.silent_calls)) ||
                   std::regex_search(fault.result.out, std::regex(row.messages));
        });
    }
}

bool is_reported(const fault& fault) {
    const bool is_prefixed_lookup = fault.name.find("IONameMatch = \"WQR_") != std::string::npos;
    const bool is_reply =
        fault.name.starts_with("call ") || fault.name.starts_with("feature report");
    return is_prefixed_lookup || (is_reply && fault.kind == failure::empty_result) ||
           !fault.result.err.empty();
}

}  // namespace tests
