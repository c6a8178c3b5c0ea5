// Where the events of the virtual host's HID event system come from.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <variant>
#include <vector>

#include "platform/hid_event.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

// The event system has been reset.
struct hid_reset {};

// The records of a statistics update, back to back.
using statistics_update = std::vector<std::uint8_t>;

// What a client of the event system gets to know.
using hid_news = std::variant<hid_event, hid_reset, statistics_update>;

class hid_event_source {
public:
    hid_event_source() = default;
    hid_event_source(const hid_event_source&) = delete;
    hid_event_source& operator=(const hid_event_source&) = delete;
    hid_event_source(hid_event_source&&) = delete;
    hid_event_source& operator=(hid_event_source&&) = delete;
    virtual ~hid_event_source() = default;

    // When the next news come; none: never.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const = 0;

    // Those news; their time has come.
    virtual hid_news take_news() = 0;
};

// The event system: makes a source for each of its clients.
using hid_event_system = std::function<std::unique_ptr<hid_event_source>()>;

}  // namespace platform::simulated
