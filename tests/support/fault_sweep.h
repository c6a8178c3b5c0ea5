// Fails each platform call of an operation in turn, in every way it can fail.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/virtual/machine.h"
#include "tests/support/capture.h"

namespace tests {

struct fault {
    std::size_t call;  // 1 is the first call of the operation
    std::string name;  // the failed call as the log writes it
    platform::simulated::failure kind;
    outcome result;
};

// Counts the calls of a successful run of operation on a host made by make_host, then runs it once
// for each call and kind of failure, each time on a new host. Every run must end, leave nothing
// open and be acceptable: by default, it wrote on standard error.
void sweep_faults(
    const std::function<std::unique_ptr<platform::simulated::machine>()>& make_host,
    const std::function<void()>& operation,
    const std::function<bool(const fault&)>& acceptable = [](const fault& fault) {
        return !fault.result.err.empty();
    });

// An operation, and what may stand in place of a failure report.
struct sweep_row {
    std::function<void()> operation;
    std::string silent_calls = "^$";  // a failure of these calls need not be reported
    std::string messages = "^$";      // what may be printed instead
};

// Does that for each row. A failed call must be reported, unless the row says otherwise, or the
// call fails with an empty result.
void sweep_faults(const std::function<std::unique_ptr<platform::simulated::machine>()>& make_host,
                  const std::vector<sweep_row>& rows);

// What most operations must do about a failed call: report it. Not required if the lookup of a
// prefixed name fails, which finds nothing in a successful run either, or if a reply is empty.
bool is_reported(const fault& fault);

}  // namespace tests
