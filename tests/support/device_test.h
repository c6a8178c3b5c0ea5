// The vocabulary of tests that work on a virtual host of their own.
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

namespace tests {

using platform::simulated::byte_list;
using platform::simulated::failure;
using platform::simulated::interface_driver;
using platform::simulated::machine;

// Registers an interface service with a name and an id; the driver that answers for it.
interface_driver& put_service(machine& host, std::string_view name, std::int32_t id);

// What a failure report says of a code.
inline constexpr const char* bad_argument_text = "bad argument (0xe00002c2)";
inline constexpr const char* no_memory_text = "out of memory (0xe00002bd)";
inline constexpr const char* unsupported_text = "unsupported request (0xe00002c7)";
inline constexpr const char* not_found_text = "service not found (0xe00002f0)";
inline constexpr const char* io_text = "device i/o failure (0xe0000401)";

// The line that a failed check of a subsystem writes, without the line number of the file.
std::string failure_line(std::string_view label, std::string_view condition, std::string_view file,
                         std::string_view code = "");

// The same of the library, whose files stand in nrxctl/.
std::string failed(std::string_view file, std::string_view condition, std::string_view code = "");

// What an operation that must end with a code writes on standard error; it writes nothing else.
std::string reported(platform::return_code expected,
                     const std::function<platform::return_code()>& operation);

// The first service with a registry name, as a client finds it.
platform::service service_named(std::string_view name);

// A host that is empty at first, installed for the length of the test; nothing may be left open on
// it when the handles of the fixture are gone.
class device_test : public ::testing::Test {
public:
    device_test() { host.record_calls(); }
    ~device_test() override { EXPECT_EQ(host.open_handles(), 0U); }
    device_test(const device_test&) = delete;
    device_test& operator=(const device_test&) = delete;

protected:
    // The logged events that begin with a word ("call", "open", "close").
    [[nodiscard]] std::vector<std::string> logged(std::string_view word) const;

    machine host;

private:
    platform::simulated::installed_machine installed_{host};
};

}  // namespace tests
