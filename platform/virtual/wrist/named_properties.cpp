// Named properties of the interface services, and the motion sensors' self-test, whose result is
// one of them.

#include <array>
#include <string_view>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct property_row {
    std::string_view service;
    std::string_view name;
    std::int64_t value;  // four bytes
};

constexpr std::array property_rows{
    property_row{"accel", "gain", fixed_point(1.0)},
    property_row{"accel", "range", 16},
    property_row{"gyro", "gain", fixed_point(0.9921875)},
    property_row{"gyro", "range", 2'000},
    property_row{"compass", "gain", fixed_point(1.00390625)},
    property_row{"pressure", "oversampling", 32},
    property_row{"als", "integration-time", 100'000},
    property_row{"WQR_wqr-button", "press-threshold", fixed_point(0.8125)},
    property_row{"WQR_wqr-button", "release-threshold", fixed_point(0.6875)},
};

byte_list four_bytes(std::uint64_t value) {
    byte_list bytes(4);
    put_le(bytes, 0, bytes.size(), value);
    return bytes;
}

// The scalar call of a motion sensor tests the axes of a mask; the property then tells which of
// them passed.
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

}  // namespace platform::simulated
