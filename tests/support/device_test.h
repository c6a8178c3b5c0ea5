// A test fixture with a virtual host, and helpers for tests that use one.
#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include <gtest/gtest.h>

#include "platform/registry.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interface_driver.h"
#include "tests/support/capture.h"
#include "tests/support/source_files.h"

namespace tests {

using platform::simulated::byte_list;
using platform::simulated::failure;
using platform::simulated::interface_driver;
using platform::simulated::machine;

// Adds an interface service with a name and an id. Returns its driver.
interface_driver& add_service(machine& host, std::string_view name, std::int32_t id);

// The texts of return codes in failure reports.
inline constexpr const char* no_memory_text = "out of memory (0xe00002bd)";
inline constexpr const char* unsupported_text = "unsupported request (0xe00002c7)";
inline constexpr const char* not_found_text = "service not found (0xe00002f0)";
inline constexpr const char* io_text = "device i/o failure (0xe0000401)";

// The failure report of a check by a subsystem, without the line number of the file.
std::string failure_line(std::string_view label, std::string_view condition, std::string_view file,
                         std::string_view code = "");

// The same for a check of the library.
std::string library_report(std::string_view file, std::string_view condition,
                           std::string_view code = "");

// Runs an operation that must return a code and print nothing. Returns what it wrote on standard
// error.
std::string report_of(platform::return_code expected,
                      const std::function<platform::return_code()>& operation);

// Finds the first service with a registry name, as a client does.
platform::service service_named(std::string_view name);

// A host without services, installed for the duration of the test. Nothing may remain open on it at
// the end.
class device_test : public ::testing::Test {
public:
    device_test() { host.record_calls(); }
    ~device_test() override { EXPECT_EQ(host.open_handles(), 0U); }
    device_test(const device_test&) = delete;
    device_test& operator=(const device_test&) = delete;

protected:
    // The log lines whose first word is kind: "call", "open", "close" and others.
    [[nodiscard]] std::vector<std::string> logged_calls(std::string_view kind) const;

    machine host;

private:
    platform::simulated::installed_machine installed_{host};
};

}  // namespace tests
