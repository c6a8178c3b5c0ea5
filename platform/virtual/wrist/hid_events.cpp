// The HID event system: each kind of notification occurs at regular intervals and is delivered a
// little later.

#include <array>
#include <chrono>
#include <cmath>
#include <memory>
#include <string_view>

#include "platform/clock.h"
#include "platform/virtual/little_endian.h"
#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

namespace {

using time = machine_clock::time;
using std::chrono::microseconds;
using std::chrono::milliseconds;

// Makes the n-th notification of a kind, which occurs at the given time.
using make_notification = hid_notification (*)(std::uint64_t ticks, std::uint64_t n);

struct kind_row {
    milliseconds first;
    milliseconds interval;
    microseconds latency;
    make_notification make;
    std::uint64_t late_every = 0;  // every late_every-th occurs late; 0: none
};

constexpr milliseconds delay{150};

hid_notification make_null(std::uint64_t ticks, std::uint64_t /*n*/) {
    return hid_event{.ticks = ticks, .type = null_event};
}

// A wrist that swings every two seconds.
hid_notification make_acceleration(std::uint64_t ticks, std::uint64_t n) {
    constexpr double samples_per_swing = 10;
    constexpr double pi = 3.14159265358979;
    const double phase = 2 * pi * static_cast<double>(n) / samples_per_swing;
    return hid_event{
        .ticks = ticks,
        .type = accelerometer_event,
        .integers = {{accelerometer_type, 1},
                     {accelerometer_subtype, 0},
                     {accelerometer_sequence, static_cast<std::int64_t>(n)}},
        .reals = {{accelerometer_x, 0.125 * std::sin(phase)},
                  {accelerometer_y, 0.0625 * std::cos(phase)},
                  {accelerometer_z, -0.984375}},
    };
}

hid_notification make_vendor_event(std::uint64_t ticks, std::uint64_t n) {
    static constexpr std::array<std::string_view, 4> texts{"scan idle", "scan lo-fi",
                                                           "button armed", "heartbeat"};
    const std::string_view text = texts[n % texts.size()];
    hid_event event{.ticks = ticks, .type = vendor_defined_event};
    event.vendor_data.assign(text.begin(), text.end());
    event.vendor_data.push_back(0);
    return event;
}

// Button down, button up.
hid_notification make_button_event(std::uint64_t ticks, std::uint64_t /*n*/) {
    constexpr std::uint32_t button_event = 2;
    return hid_event{.ticks = ticks, .type = button_event};
}

hid_notification make_reset(std::uint64_t /*ticks*/, std::uint64_t /*n*/) {
    return hid_reset{};
}

struct statistics_row {
    std::uint8_t operation;
    std::uint8_t key;
    std::int32_t value;
};

// A press of the button in the statistics of the firmware.
constexpr std::array statistics_rows{
    statistics_row{3, 0, 1},                  // one more click
    statistics_row{2, 1, 42},                 // single clicks
    statistics_row{6, 11, 7'733'248},         // duration: 118.0
    statistics_row{5, 24, q16_16(12.40625)},  // proximity signal
    statistics_row{1, 19, 0},                 // timeouts are reset
    statistics_row{0, 57, 0},
};

hid_notification make_statistics(std::uint64_t /*ticks*/, std::uint64_t n) {
    constexpr std::size_t record_size = 7;
    constexpr std::size_t rows_per_update = 3;
    statistics_update records(rows_per_update * record_size);
    for (std::size_t i = 0; i < rows_per_update; ++i) {
        const statistics_row& row =
            statistics_rows[(n * rows_per_update + i) % statistics_rows.size()];
        const auto record = byte_span(records).subspan(i * record_size, record_size);
        record[1] = row.operation;
        record[2] = row.key;
        store_le(record, 3, sizeof(row.value), static_cast<std::uint32_t>(row.value));
    }
    return records;
}

constexpr std::array kind_rows{
    kind_row{milliseconds(50), milliseconds(1'000), microseconds(84), make_null},
    kind_row{milliseconds(100), milliseconds(200), microseconds(352), make_acceleration},
    kind_row{milliseconds(250), milliseconds(500), microseconds(1'217), make_vendor_event, 7},
    kind_row{milliseconds(620), milliseconds(1'500), microseconds(640), make_button_event},
    kind_row{milliseconds(900), milliseconds(2'000), microseconds(0), make_statistics},
    kind_row{milliseconds(1'600), milliseconds(20'000), microseconds(0), make_reset},
};

class wrist_events final : public hid_event_source {
public:
    explicit wrist_events(time start) : start_(start) {}

    [[nodiscard]] std::optional<time> next_due() const override {
        const std::size_t next = next_kind();
        return time_of(next) + kind_rows[next].latency;
    }

    hid_notification pop_notification() override {
        const std::size_t next = next_kind();
        const auto ticks = std::chrono::duration<double>(time_of(next)).count() / tick_period();
        hid_notification notification =
            kind_rows[next].make(static_cast<std::uint64_t>(ticks), emitted_[next]);
        if (auto* event = std::get_if<hid_event>(&notification)) {
            event->latency_nanoseconds = time(kind_rows[next].latency).count();
        }
        ++emitted_[next];
        return notification;
    }

private:
    [[nodiscard]] time time_of(std::size_t kind) const {
        const kind_row& row = kind_rows[kind];
        const std::uint64_t n = emitted_[kind];
        const bool is_late = row.late_every != 0 && n % row.late_every == row.late_every - 1;
        return start_ + row.first + static_cast<time::rep>(n) * time(row.interval) +
               (is_late ? time(delay) : time(0));
    }

    [[nodiscard]] std::size_t next_kind() const {
        std::size_t next = 0;
        for (std::size_t kind = 1; kind < kind_rows.size(); ++kind) {
            if (time_of(kind) + kind_rows[kind].latency < time_of(next) + kind_rows[next].latency)
                next = kind;
        }
        return next;
    }

    const time start_;
    std::array<std::uint64_t, kind_rows.size()> emitted_{};  // number of each kind
};

}  // namespace

void add_hid_events(machine& device) {
    device.set_hid_events(
        [&clock = device.clock()] { return std::make_unique<wrist_events>(clock.now()); });
}

}  // namespace platform::simulated
