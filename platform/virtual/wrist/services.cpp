// The interface services and their functions.

#include <algorithm>
#include <array>
#include <cassert>
#include <ctime>
#include <memory>
#include <string>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/profiler.h"
#include "platform/virtual/replay_app.h"
#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

// --- services ---

namespace {

struct service_row {
    std::string_view name;   // registry name
    std::int32_t id;         // "service_id"
    std::string_view child;  // entry that clients open instead of the service; empty: none
};

// In registration order. Services of the always-on processor have the prefix WQR_.
constexpr std::array services{
    service_row{"accel", 0x10, ""},
    service_row{"gyro", 0x11, ""},
    service_row{"compass", 0x12, ""},
    service_row{"pressure", 0x13, ""},
    service_row{"als", 0x14, ""},
    service_row{"temperature", 0x15, ""},
    service_row{"mux", 0x20, ""},
    service_row{"mca", 0x21, ""},
    service_row{"morvane", 0x22, ""},
    service_row{"baseband", 0x30, ""},
    service_row{"btmspk", 0x31, ""},
    service_row{"arc", 0x32, ""},
    service_row{"WQR_wqr-button", 0x40, ""},
    service_row{"profile", 0x50, ""},
    service_row{"NRXApp", 0x51, "NRXAppClient"},
};

}  // namespace

void add_interface_services(machine& device) {
    for (const service_row& row : services) {
        const auto driver = std::make_shared<interface_driver>();
        const entry_ref service = device.add({.name = std::string(row.name),
                                              .classes = {"KeltoNRXInterface"},
                                              .properties = {{"service_id", row.id}},
                                              .driver = driver});
        if (row.child.empty()) continue;
        device.add({.name = std::string(row.child),
                    .classes = {"KeltoNRXInterfaceClient"},
                    .driver = driver},
                   service);
    }
}

interface_driver& interface_of(const machine& device, std::string_view service) {
    const entry_ref entry = device.find(service);
    assert(entry);
    auto* driver = dynamic_cast<interface_driver*>(entry->driver.get());
    assert(driver != nullptr);
    return *driver;
}

void add_reports(const machine& device, std::span<const service_report> reports) {
    for (const service_report& row : reports) {
        interface_of(device, row.service)
            .set_report(row.id, byte_list(row.bytes.begin(), row.bytes.end()));
    }
}

// --- named properties, and the self-test of the motion sensors, whose result is one of them ---

namespace {

struct property_row {
    std::string_view service;
    std::string_view name;
    std::int64_t value;  // four bytes
};

constexpr std::array property_rows{
    property_row{"accel", "gain", q16_16(1.0)},
    property_row{"accel", "range", 16},
    property_row{"gyro", "gain", q16_16(0.9921875)},
    property_row{"gyro", "range", 2'000},
    property_row{"compass", "gain", q16_16(1.00390625)},
    property_row{"pressure", "oversampling", 32},
    property_row{"als", "integration-time", 100'000},
    property_row{"WQR_wqr-button", "press-threshold", q16_16(0.8125)},
    property_row{"WQR_wqr-button", "release-threshold", q16_16(0.6875)},
};

byte_list four_bytes(std::uint64_t value) {
    byte_list bytes(4);
    store_le(bytes, 0, bytes.size(), value);
    return bytes;
}

// The scalar call of a motion sensor tests the axes in a mask. The property then holds the mask of
// the axes that passed.
void add_self_test(interface_driver& sensor) {
    constexpr std::uint64_t all_axes = 7;
    sensor.set_named_property("self-test", four_bytes(0));
    sensor.set_scalar_method([&sensor](std::span<const std::uint64_t> scalars) {
        if (scalars.size() != 1 || scalars[0] == 0 || scalars[0] > all_axes) return bad_argument;
        sensor.set_named_property("self-test", four_bytes(scalars[0]));
        return success;
    });
}

}  // namespace

void add_named_properties(machine& device) {
    for (const property_row& row : property_rows) {
        interface_of(device, row.service)
            .set_named_property(row.name, four_bytes(static_cast<std::uint64_t>(row.value)));
    }
    for (const char* sensor : {"accel", "gyro", "compass"}) {
        add_self_test(interface_of(device, sensor));
    }
}

// --- the service "mca": power, a mode for each setting, and two reports ---

namespace {

constexpr std::uint32_t power_command = 0x20;
constexpr std::uint32_t mode_command = 0x22;
constexpr std::size_t mode_payload_size = 69;
constexpr std::array<std::uint32_t, 3> settings{16, 60, 128};
constexpr std::uint32_t max_mode = 3;

constexpr std::uint32_t interval_report = 0x16;
constexpr std::uint32_t buffer_report = 0xd8;

// The name of the property with the mode of a setting.
std::string mode_property(std::uint32_t setting) {
    return "mode-" + std::to_string(setting);
}

return_code switch_power(interface_driver& mca, byte_view payload) {
    if (payload.size() != 1 || payload[0] > 1) return bad_argument;
    mca.set_named_property("power", {payload[0]});
    return success;
}

// The payload is the setting, the number 1, the mode, and reserved bytes that are 0.
return_code set_mode(interface_driver& mca, byte_view payload) {
    if (payload.size() != mode_payload_size || payload[4] != 1) return bad_argument;
    const std::uint32_t setting = load_u32(payload, 0);
    const std::uint32_t mode = load_u32(payload, 5);
    const auto reserved = payload.subspan(9);
    const bool is_known = std::find(settings.begin(), settings.end(), setting) != settings.end();
    const bool is_zero =
        std::all_of(reserved.begin(), reserved.end(), [](auto byte) { return byte == 0; });
    if (!is_known || mode > max_mode || !is_zero) return bad_argument;
    mca.set_named_property(mode_property(setting), byte_list(&payload[5], &payload[9]));
    return success;
}

// Adds a report of a fixed size.
void add_sized_report(interface_driver& service, std::uint32_t id, std::size_t size) {
    service.set_report(id, byte_list(size));
    service.set_report_sink(
        id, [size](byte_view report) { return report.size() == size ? success : bad_argument; });
}

}  // namespace

void add_mca(machine& device) {
    interface_driver& mca = interface_of(device, "mca");
    mca.set_named_property("power", {0});
    for (const std::uint32_t setting : settings) {
        mca.set_named_property(mode_property(setting), byte_list(4));
    }
    mca.set_command(power_command, [&mca](byte_view payload, byte_list& /*reply*/) {
        return switch_power(mca, payload);
    });
    mca.set_command(mode_command, [&mca](byte_view payload, byte_list& /*reply*/) {
        return set_mode(mca, payload);
    });
    add_sized_report(mca, interval_report, 4);
    add_sized_report(mca, buffer_report, 24);
}

// --- replay: motion and pressure sensors can play back samples; none are loaded ---

namespace {

struct replay_row {
    std::string_view service;
    std::uint32_t record_size;
};

constexpr std::array replay_rows{
    replay_row{"accel", 28},
    replay_row{"gyro", 28},
    replay_row{"compass", 28},
    replay_row{"pressure", 20},
};

std::int32_t id_of(const machine& device, std::string_view service) {
    const auto id = device.find(service)->properties.find("service_id")->number();
    return static_cast<std::int32_t>(id.value_or(0));
}

}  // namespace

void add_replay(machine& device) {
    std::vector<replay_service> replay_services;
    for (const replay_row& row : replay_rows)
        replay_services.push_back({id_of(device, row.service), row.record_size});
    const auto app = std::make_shared<replay_app>(replay_services);
    serve_replay(interface_of(device, "NRXApp"), app);
    device.find("NRXAppClient")->driver = make_replay_client(app);
}

// --- profiler: nothing is enabled yet ---

void add_profiler(machine& device, std::uint32_t events_per_second) {
    const auto shared = add_profiler_driver(device);
    shared->stream()->set_rate(events_per_second);
    shared->dump_errors();
    serve_profile(interface_of(device, "profile"), shared);
}

// --- clocks: those of the host, monotonic for the coprocessor and wall for the calendar ---

namespace {

std::int64_t read_clock(clockid_t clock) {
    timespec now{};
    ::clock_gettime(clock, &now);
    return std::int64_t{now.tv_sec} * 1'000'000'000 + now.tv_nsec;
}

// The time of the host's last tick on both clocks.
sync_point last_tick() {
    sync_point point{};
    do {
        point.coprocessor = read_clock(CLOCK_MONOTONIC_COARSE);
        point.calendar = read_clock(CLOCK_REALTIME_COARSE);
    } while (point.coprocessor != read_clock(CLOCK_MONOTONIC_COARSE));
    return point;
}

calendar_instant boot_instant() {
    constexpr std::int64_t microseconds_per_second = 1'000'000;
    const std::int64_t booted = (read_clock(CLOCK_REALTIME) - read_clock(CLOCK_BOOTTIME)) / 1000;
    return {booted / microseconds_per_second, booted % microseconds_per_second};
}

}  // namespace

void add_clocks(machine& device) {
    device.set_boot_time(boot_instant());
    add_time_sync(device, last_tick);
}

}  // namespace platform::simulated
