// A host with both halves of a profiler whose answers are scripted.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "nrxctl/base/profile_record.h"
#include "tests/support/device_test.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

using lines = std::vector<std::string>;

inline constexpr const char* driver_name = "KeltoNRXProfileDriver";

// The kernel's driver: every method succeeds with nothing unless a script says otherwise.
class scripted_driver final : public platform::simulated::driver {
public:
    // What a method answers, call after call; the last answer stays.
    struct answer {
        platform::return_code code = platform::success;
        byte_list bytes = {};
        std::uint64_t scalar = 0;
    };

    platform::return_code call(std::uint32_t selector, const platform::call_inputs& inputs,
                               platform::call_outputs& outputs) override;
    std::shared_ptr<platform::simulated::shared_queue> memory(std::uint32_t type) override {
        return type == 0 ? queue : nullptr;
    }
    std::shared_ptr<platform::simulated::shared_queue> notification(std::uint32_t type) override {
        return memory(type);
    }

    std::map<std::uint32_t, std::vector<answer>> answers;
    std::map<std::uint32_t, std::function<void()>> actions;  // done when a method is called
    std::shared_ptr<platform::simulated::shared_queue> queue =
        std::make_shared<platform::simulated::shared_queue>();
};

// A record of a type, whose other bytes tell it from others.
byte_list record_bytes(std::uint8_t type, std::uint8_t mark);

// The line that the undecoded printer writes for it.
std::string dumped(std::uint8_t type, std::uint8_t mark);

// Several byte lists, one after the other.
byte_list joined(const std::vector<byte_list>& lists);

// A configuration record without services in the words of the log: bytes of profiler, component and
// state, and the report mask.
std::string config_bytes(const std::string& profiler, const std::string& component,
                         const std::string& state, const std::string& mask);

// Whether an interrupt would end the process.
bool has_default_action();

// Calls on the driver, in the words of the log.
inline constexpr const char* enable_call =
    "call KeltoNRXProfileDriver 0 scalars [0x1] in [] results 0 room 0";
inline constexpr const char* disable_call =
    "call KeltoNRXProfileDriver 0 scalars [0x0] in [] results 0 room 0";
inline constexpr const char* status_call =
    "call KeltoNRXProfileDriver 1 scalars [] in [] results 1 room 0";
inline constexpr const char* end_stream_call =
    "call KeltoNRXProfileDriver 11 scalars [] in [] results 0 room 0";

class profiler_test : public device_test {
protected:
    // The tool's clock is the host's.
    void SetUp() override;
    // Whatever was done, an interrupt ends the process again.
    void TearDown() override;

    // Registers the kernel's driver and the service "profile", which takes every request of the
    // profiler and answers with nothing.
    void put_both_halves();
    scripted_driver& put_driver();
    interface_driver& put_profile_service();

    // Lets the service answer a command.
    void answer(std::uint32_t command, platform::return_code code, const byte_list& reply = {});

    // How often a call was made.
    [[nodiscard]] std::ptrdiff_t times(std::string_view call) const;

    // The calls and what else happened on the host since the last time, but for services looked up
    // and released.
    lines happened();

    // Runs a subcommand as the command line gives it; taken is then how many further words it took.
    outcome profile(const std::string& words);
    int taken = 0;

    scripted_driver* driver = nullptr;
    interface_driver* service = nullptr;

private:
    std::size_t seen_ = 0;
};

// Source files of the library, and failure reports of checks in them.
inline constexpr const char* apply_file = "profiler/apply_configs.cpp";
inline constexpr const char* channel_file = "base/channel.cpp";
inline constexpr const char* command_file = "base/command_channel.cpp";
inline constexpr const char* conn_file = "profiler/profiler_conn.cpp";
inline constexpr const char* grammar_file = "profiler/config_grammar.cpp";
inline constexpr const char* kernel_file = "profiler/kernel_profiler.cpp";
inline constexpr const char* monitor_file = "profiler/monitor.cpp";

}  // namespace tests
