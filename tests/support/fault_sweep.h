// Fails each platform call of an operation in turn, in every way it can fail.
#pragma once

#include <functional>
#include <memory>
#include <string>

#include "platform/virtual/machine.h"
#include "tests/support/capture.h"

namespace tests {

struct fault {
    std::size_t call;  // 1 is the first call of the operation
    std::string name;  // the failed call in the words of the log
    platform::simulated::failure how;
    outcome result;
};

// Counts the calls of a good run of operation on a host made by make_host, then runs it once per
// call and failure on a fresh host each. Every run must end, leave nothing open, and be acceptable:
// by default, it wrote on standard error.
void sweep_faults(
    const std::function<std::unique_ptr<platform::simulated::machine>()>& make_host,
    const std::function<void()>& operation,
    const std::function<bool(const fault&)>& acceptable = [](const fault& one) {
        return !one.result.err.empty();
    });

// What most operations owe to a failed call: a report. Not owed where the failure tells nothing new
// (the look-up of a prefixed name finds none in a good run either) or is none (a reply without
// bytes).
bool is_told(const fault& one);

}  // namespace tests
