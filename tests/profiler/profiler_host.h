// A host with both halves of a profiler whose replies are scripted.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "platform/interrupt.h"
#include "tests/support/device_test.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

namespace file = source_file;

// The kernel's driver: every method succeeds and returns nothing unless a script says otherwise.
class scripted_driver final : public platform::simulated::driver {
public:
    using queue_pointer = std::shared_ptr<platform::simulated::shared_queue>;

    // The replies of a method, call by call; the last one is repeated.
    struct reply {
        platform::return_code code = platform::success;
        byte_list bytes = {};
        std::uint64_t scalar = 0;
    };

    platform::return_code call(std::uint32_t method, const platform::call_inputs& inputs,
                               platform::call_outputs& outputs) override;
    queue_pointer memory(std::uint32_t type) override { return type == 0 ? queue : nullptr; }
    queue_pointer notification(std::uint32_t type) override { return memory(type); }

    std::map<std::uint32_t, std::vector<reply>> replies;
    std::map<std::uint32_t, std::function<void()>> actions;  // run when a method is called
    queue_pointer queue = std::make_shared<platform::simulated::shared_queue>();
};

// A record of a type, with all other bytes set to fill, and the line that is its dump.
byte_list record_bytes(std::uint8_t type, std::uint8_t fill);
std::string dumped(std::uint8_t type, std::uint8_t fill);
inline const byte_list end_marker = record_bytes(0, 0);

byte_list joined(const std::vector<byte_list>& lists);

// The failure report of a check whose condition is "kr == 0 ".
inline std::string kr_report(const char* source, const char* code) {
    return library_report(source, "kr == 0 ", code);
}

bool has_default_interrupt_action();

// The result of an operation, and all that it wrote.
using result = std::pair<bool, std::string>;
result attempt(const std::function<bool()>& operation);

// The tool's clock is the host's. After each test, interrupts are not handled any more.
class profiler_test : public device_test {
public:
    // The driver, and the service "profile", which accepts every request and returns nothing.
    profiler_test();
    ~profiler_test() override {
        platform::request_interrupt();
        EXPECT_FALSE(platform::interrupt_received());
    }
    profiler_test(const profiler_test&) = delete;
    profiler_test& operator=(const profiler_test&) = delete;

protected:
    void remove_driver() { host.remove("KeltoNRXProfileDriver"); }
    void remove_service() { host.remove("profile"); }

    // Sets the reply of the service to a command.
    void set_reply(std::uint32_t command, platform::return_code code, const byte_list& reply = {});

    // Sets the log of the coprocessor: a record that is read once.
    void set_fw_log(const byte_list& record);

    // The log entries since the last call, abbreviated, without lookups and releases; and the
    // method calls in it, such as "profile 3 [0x24] in [01 zeros]": scalars in brackets, "zeros"
    // for 36 of them.
    std::string new_events();
    std::string new_calls();

    // Runs a subcommand with its arguments; arguments_read is then how many of them it read.
    outcome profile(const std::string& command_line);
    int arguments_read = 0;

    scripted_driver* driver = nullptr;
    interface_driver* service = nullptr;

private:
    std::size_t seen_ = 0;
};

}  // namespace tests
