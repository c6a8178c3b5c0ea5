// HID devices and an event system whose records and events are scripted.
#pragma once

#include <cstdint>
#include <deque>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/virtual/hid_sources.h"
#include "tests/support/device_test.h"

namespace tests {

using clock_time = platform::simulated::machine_clock::time;

// Records that come at times of the host's clock, while the mode is on. Its mode calls are kept.
class scripted_records final : public platform::simulated::record_source {
public:
    platform::return_code set_mode(std::int32_t service_id, std::uint32_t mode) override {
        modes.emplace_back(service_id, mode);
        return mode_result;
    }
    [[nodiscard]] std::optional<clock_time> next_due() const override;
    byte_list pop_record() override;

    std::vector<std::pair<std::int32_t, std::uint32_t>> modes;
    platform::return_code mode_result = platform::success;
    std::deque<std::pair<clock_time, byte_list>> script;
};

// Registers a HID device with a plug-in at a location.
scripted_records& add_hid_device(machine& host, std::string_view name, std::int32_t location);

using scripted_notifications =
    std::deque<std::pair<clock_time, platform::simulated::hid_notification>>;

// Gives the host an event system that tells each of its clients these notifications.
void set_hid_events_script(machine& host, scripted_notifications notifications);

}  // namespace tests
