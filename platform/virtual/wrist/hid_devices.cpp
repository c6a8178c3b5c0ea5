// The HID devices: their place in the registry, their SPI status records, and their driver.

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "platform/registry.h"
#include "platform/virtual/little_endian.h"
#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

constexpr const char* device_class = "KeltoNRXHIDDevice";

// --- the devices on the interface services ---

struct usage_row {
    std::int32_t page;
    std::int32_t usage;
};

struct hid_row {
    std::string_view service;  // the interface service, whose id is the device's location
    std::string_view name;     // registry name
    usage_row primary;
    usage_row secondary;  // {0, 0}: none
};

constexpr std::array hid_devices{
    hid_row{"accel", "accel-hid", {0x20, 0x73}, {}},
    hid_row{"gyro", "gyro-hid", {0x20, 0x76}, {}},
    hid_row{"compass", "compass-hid", {0x20, 0x83}, {}},
    hid_row{"pressure", "pressure-hid", {0x20, 0x31}, {}},
    hid_row{"als", "als-hid", {0x20, 0x41}, {}},
    hid_row{"temperature", "temperature-hid", {0x20, 0x33}, {}},
    hid_row{"WQR_wqr-button", "wqr-button-hid", {0xff00, 0x20}, {0x0c, 0x40}},
};

dictionary usage_pair(const usage_row& row) {
    return {{std::string(usage_page_key), row.page}, {std::string(usage_key), row.usage}};
}

array usage_pairs(const hid_row& row) {
    array pairs{usage_pair(row.primary)};
    if (row.secondary.page != 0) pairs.emplace_back(usage_pair(row.secondary));
    return pairs;
}

void add_devices(machine& device) {
    for (const hid_row& row : hid_devices) {
        const entry_ref service = device.find(row.service);
        device.add(
            {.name = std::string(row.name),
             .classes = {device_class, "IOHIDDevice"},
             .properties = {{std::string(location_id_key), *service->properties.find("service_id")},
                            {std::string(usage_pairs_key), usage_pairs(row)}},
             .hid = std::make_shared<virtual_hid_device>()},
            service);
    }
}

// --- the event path of each device: HID interface, event driver, event queue ---

struct event_row {
    std::string_view service;  // the interface service, whose name the HID interface has
    std::string_view device;   // the HID device on it
    std::int32_t events;       // since start
    std::int32_t dropped;      // events lost because the queue was full
    std::int64_t last_event;   // nanoseconds ago
    std::int64_t last_drop;    // nanoseconds ago; 0: none
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

void add_event_paths(machine& device) {
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

// --- SPI status records: data sent and received on the bus, and the status of the transfers ---

constexpr std::chrono::milliseconds record_interval{50};
constexpr std::size_t record_header_size = 9;

constexpr std::array<std::uint8_t, 8> sent{0x80, 0x3b, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00};
constexpr std::array<std::uint8_t, 20> received{0x00, 0x00, 0xfe, 0xc4, 0x01, 0x1c, 0x3f,
                                                0xd8, 0x0b, 0x52, 0x00, 0x13, 0xff, 0xe6,
                                                0x00, 0x07, 0x5a, 0x00, 0x00, 0x91};
constexpr std::array<std::uint8_t, 12> variance{0x1a, 0x03, 0x00, 0x00, 0xc4, 0x02,
                                                0x00, 0x00, 0x59, 0x04, 0x00, 0x00};
constexpr std::array<std::uint8_t, 8> good{0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00};
constexpr std::array<std::uint8_t, 8> bad_checksum{0x01, 0x70, 0x00, 0x00, 0x3c, 0x00, 0x00, 0x00};
constexpr std::array<std::uint8_t, 8> dropped{0x05, 0x70, 0x00, 0x00, 0x02, 0x00, 0x00, 0x00};

struct record_row {
    std::uint8_t type;
    byte_view bytes;
};

// Sent in a cycle.
constexpr std::array record_rows{
    record_row{0, sent},     record_row{1, received},     record_row{3, variance},
    record_row{2, good},     record_row{0, sent},         record_row{1, received},
    record_row{2, dropped},  record_row{0, sent},         record_row{1, received},
    record_row{3, variance}, record_row{2, bad_checksum},
};

class spi_records final : public record_source {
public:
    // The clock must outlive the records.
    spi_records(const machine_clock& clock, std::int64_t service_id)
        : clock_(clock), service_id_(service_id) {}

    return_code set_mode(std::int32_t service_id, std::uint32_t mode) override {
        if (service_id != service_id_) return bad_argument;
        is_on_ = mode != 0;
        next_time_ = clock_.now() + record_interval;
        next_row_ = 0;
        return success;
    }

    [[nodiscard]] std::optional<machine_clock::time> next_due() const override {
        return is_on_ ? std::optional(next_time_) : std::nullopt;
    }

    std::vector<std::uint8_t> pop_record() override {
        const record_row& row = record_rows[next_row_];
        const auto time = std::chrono::duration_cast<std::chrono::microseconds>(next_time_);
        std::vector<std::uint8_t> record(record_header_size + row.bytes.size());
        store_le(record, 0, sizeof(std::uint64_t), static_cast<std::uint64_t>(time.count()));
        record[record_header_size - 1] = row.type;
        std::copy(row.bytes.begin(), row.bytes.end(), record.begin() + record_header_size);
        next_row_ = (next_row_ + 1) % record_rows.size();
        next_time_ += record_interval;
        return record;
    }

private:
    const machine_clock& clock_;
    const std::int64_t service_id_;
    bool is_on_ = false;
    machine_clock::time next_time_{0};
    std::size_t next_row_ = 0;
};

void add_spi_records(machine& device) {
    for (const entry_ref& entry : device.entries_of_class(device_class)) {
        const property* location = entry->properties.find(location_id_key);
        entry->records = std::make_shared<spi_records>(device.clock(), *location->number());
    }
}

// --- the driver of all HID devices ---

constexpr std::int32_t driver_location = 1234;
constexpr std::uint32_t client_type = 0x7a756d6f;  // "zumo"
constexpr std::size_t request_size = 8;
constexpr std::size_t reply_size = 16;

constexpr std::uint64_t driver_version = 0x00'03'01'0c;

// A request is two 32-bit words, the kind of request and a location. The reply is the request
// followed by a 64-bit value.
class hid_driver final : public driver {
public:
    // The machine owns the driver, so it outlives it.
    explicit hid_driver(const machine& device) : device_(device) {}

    return_code open(std::uint32_t type) override {
        return type == client_type ? success : unsupported;
    }

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        if (selector != 0) return unsupported;
        return_code result = check_arguments(
            {0, argument_rule::required, 0, argument_rule::required}, inputs, outputs);
        if (result != success) return result;
        if (inputs.structure.size() != request_size) return bad_argument;
        std::uint64_t value = 0;
        result = handle_request(load_u32(inputs.structure, 0),
                                load_u32(inputs.structure, sizeof(value) / 2), value);
        if (result != success) return result;
        std::array<std::uint8_t, reply_size> reply{};
        std::copy(inputs.structure.begin(), inputs.structure.end(), reply.begin());
        store_le(reply, request_size, sizeof(value), value);
        return copy_reply(reply, outputs);
    }

private:
    // Requests: the driver's version, the number of HID devices, the number of usages of a device.
    [[nodiscard]] return_code handle_request(std::uint32_t request, std::uint32_t location,
                                             std::uint64_t& value) const {
        switch (request) {
            case 0:
                value = driver_version;
                return success;
            case 1:
                value = count_devices();
                return success;
            case 2:
                return count_usages(location, value);
            default:
                return unsupported;
        }
    }

    [[nodiscard]] std::uint64_t count_devices() const {
        const auto& devices = device_.entries_of_class(device_class);
        const auto is_present = [](const entry_ref& device) { return device->present; };
        return static_cast<std::uint64_t>(
            std::count_if(devices.begin(), devices.end(), is_present));
    }

    [[nodiscard]] return_code count_usages(std::uint32_t location, std::uint64_t& value) const {
        const property expected(static_cast<std::int32_t>(location));
        for (const entry_ref& device : device_.entries_of_class(device_class)) {
            if (!device->present ||
                !same_value(*device->properties.find(location_id_key), expected))
                continue;
            value = device->properties.find(usage_pairs_key)->items()->size();
            return success;
        }
        return not_found;
    }

    const machine& device_;
};

void add_driver(machine& device) {
    device.add({.name = "KeltoNRXHIDDriver",
                .classes = {"KeltoNRXHIDDriver"},
                .properties = {{std::string(location_id_key), driver_location}},
                .driver = std::make_shared<hid_driver>(device)});
}

}  // namespace

void add_hid_devices(machine& device) {
    add_devices(device);
    add_event_paths(device);
    add_spi_records(device);
    add_driver(device);
}

}  // namespace platform::simulated
