// What HID devices and the HID event system of the virtual host deliver: feature reports, records
// and events.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <utility>
#include <variant>
#include <vector>

#include "platform/hid_event.h"
#include "platform/return_code.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

// The feature reports of a HID device.
class virtual_hid_device {
public:
    // Adds or replaces a feature report.
    void set_feature_report(std::uint8_t id, std::vector<std::uint8_t> bytes) {
        feature_reports_.insert_or_assign(id, std::move(bytes));
    }

    void drop_feature_report(std::uint8_t id) { feature_reports_.erase(id); }

    // The bytes of a feature report, owned by the device; null if there is no such report.
    [[nodiscard]] const std::vector<std::uint8_t>* feature_report(std::uint8_t id) const {
        const auto match = feature_reports_.find(id);
        return match == feature_reports_.end() ? nullptr : &match->second;
    }

private:
    std::map<std::uint8_t, std::vector<std::uint8_t>> feature_reports_;
};

// The records that a HID device sends through its driver's plug-in.
class record_source {
public:
    record_source() = default;
    record_source(const record_source&) = delete;
    record_source& operator=(const record_source&) = delete;
    record_source(record_source&&) = delete;
    record_source& operator=(record_source&&) = delete;
    virtual ~record_source() = default;

    // Sets the mode for a service; mode 0 is off.
    virtual return_code set_mode(std::int32_t service_id, std::uint32_t mode) = 0;

    // Time of the next record; nullopt if there is none, as when the mode is off.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const = 0;

    // Removes and returns the next record, which is due.
    virtual std::vector<std::uint8_t> pop_record() = 0;
};

// Tells a client that the event system was reset.
struct hid_reset {};

// The records of a statistics update, back to back.
using statistics_update = std::vector<std::uint8_t>;

// What the event system reports to a client.
using hid_notification = std::variant<hid_event, hid_reset, statistics_update>;

class hid_event_source {
public:
    hid_event_source() = default;
    hid_event_source(const hid_event_source&) = delete;
    hid_event_source& operator=(const hid_event_source&) = delete;
    hid_event_source(hid_event_source&&) = delete;
    hid_event_source& operator=(hid_event_source&&) = delete;
    virtual ~hid_event_source() = default;

    // Time of the next notification; nullopt if there is none.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const = 0;

    // Removes and returns the next notification, which is due.
    virtual hid_notification pop_notification() = 0;
};

// Creates the event source of a new client.
using hid_event_source_factory = std::function<std::unique_ptr<hid_event_source>()>;

}  // namespace platform::simulated
