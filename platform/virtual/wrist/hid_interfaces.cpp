// The way of the events behind a HID device: its interface, the driver that makes the events, and
// the client that queues them, each attached to the one before.

#include <array>
#include <string>
#include <string_view>

#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

struct event_row {
    std::string_view service;  // the interface service; the HID interface has its name
    std::string_view device;   // the HID device on it
    std::int32_t events;       // since start
    std::int32_t dropped;      // of these, for want of room
    std::int64_t last_event;   // nanoseconds ago, as the next
    std::int64_t last_drop;    // 0: there was none
};

constexpr std::array event_counts{
    event_row{"accel", "accel-hid", 8'641'211, 4, 4'217'083, 3'611'482'906'250},
    event_row{"gyro", "gyro-hid", 8'640'869, 4, 4'302'541, 3'611'483'114'583},
    event_row{"compass", "compass-hid", 864'112, 0, 61'804'375, 0},
    event_row{"pressure", "pressure-hid", 86'410, 0, 712'655'208, 0},
    event_row{"als", "als-hid", 20'417, 0, 1'934'220'416, 0},
    event_row{"temperature", "temperature-hid", 17'281, 0, 2'608'117'750, 0},
    event_row{"WQR_wqr-button", "wqr-button-hid", 14'806, 0, 41'266'903'125, 0},
};

property debug_state(dictionary numbers) {
    return numbers;
}

}  // namespace

void add_hid_interfaces(machine& device) {
    for (const event_row& row : event_counts) {
        const std::string name(row.service);
        const entry_ref hid_interface = device.add(
            {.name = name, .classes = {"KeltoNRXHIDInterface"}}, device.find(row.device));
        const entry_ref events =
            device.add({.name = name + "-events",
                        .classes = {"KeltoNRXHIDEventDriver"},
                        .properties = {{"DebugState", debug_state({{"_num_events", row.events}})}}},
                       hid_interface);
        const property queue =
            debug_state({{"EnqueueEventCount", std::int64_t{row.events} - row.dropped},
                         {"DroppedEventCount", row.dropped},
                         {"LastEventTime", row.last_event},
                         {"LastDroppedEventTime", row.last_drop}});
        device.add({.name = name + "-event-queue",
                    .classes = {"KeltoNRXHIDEventClient"},
                    .properties = {{"DebugState", queue}}},
                   events);
    }
}

}  // namespace platform::simulated
