// A host with both halves of a profiler whose answers are scripted.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "nrxctl/base/profile_record.h"
#include "tests/support/device_test.h"

namespace tests {

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

// Little-endian 32-bit words.
byte_list words_of(const std::vector<std::uint32_t>& words);

// Whether an interrupt would end the process.
bool has_default_action();

class profiler_test : public device_test {
protected:
    // Registers the kernel's driver and the service "profile", which takes every request of the
    // profiler and answers with nothing.
    void put_both_halves();
    scripted_driver& put_driver();
    interface_driver& put_profile_service();

    // The calls and what else happened on the host since the last time, but for services looked up
    // and released.
    std::vector<std::string> happened();

    // Runs a subcommand as the command line gives it; taken is then how many further words it took.
    outcome profile(std::vector<std::string> words);
    int taken = 0;

    scripted_driver* driver = nullptr;
    interface_driver* service = nullptr;

private:
    std::size_t seen_ = 0;
};

// Failure reports of the library.
std::string failed(std::string_view file, std::string_view condition, std::string_view code = "");

}  // namespace tests
