// The embedded device's services with a manual clock, and nrxctl's entry in this process.
#pragma once

#include <string>
#include <vector>

#include "tests/support/device_test.h"

namespace tests {

class options_host : public device_test {
protected:
    options_host();

    // Runs arguments with a space between them. The status is that of a return from main.
    static outcome run(const std::string& arguments);

    // The number of calls of drivers so far.
    [[nodiscard]] std::size_t driver_calls() const { return logged_calls("call").size(); }

    interface_driver& service;  // "x", 0x70, without reports and methods
};

}  // namespace tests
