// Events of the host's HID event system.
#pragma once

#include <cstdint>
#include <vector>

namespace platform {

// The types of event that the tool tells apart.
inline constexpr std::uint32_t null_event = 0;
inline constexpr std::uint32_t vendor_defined_event = 1;
inline constexpr std::uint32_t accelerometer_event = 13;

// Fields of an accelerometer event: the acceleration, then three integers.
inline constexpr std::uint32_t accelerometer_x = 0xd0000;
inline constexpr std::uint32_t accelerometer_y = 0xd0001;
inline constexpr std::uint32_t accelerometer_z = 0xd0002;
inline constexpr std::uint32_t accelerometer_type = 0xd0003;
inline constexpr std::uint32_t accelerometer_subtype = 0xd0004;
inline constexpr std::uint32_t accelerometer_sequence = 0xd0005;

// One event. Plain value semantics: a copy shares nothing with its source.
struct hid_event {
    template <class Number>
    struct field {
        std::uint32_t id;
        Number value;
    };

    // When it happened, in ticks of the monotonic clock.
    std::uint64_t ticks = 0;
    std::uint32_t type = null_event;
    // How long after that it was handed over.
    std::int64_t latency_nanoseconds = 0;
    std::vector<field<std::int64_t>> integers = {};
    std::vector<field<double>> fractions = {};
    // What a vendor-defined event carries.
    std::vector<std::uint8_t> vendor_data = {};

    // The latency in units of so many nanoseconds, which are more than 0, rounded towards 0.
    [[nodiscard]] std::int64_t latency(std::int64_t scale) const {
        return latency_nanoseconds / scale;
    }

    // The value of a field; 0 if the event has no such field.
    [[nodiscard]] std::int64_t integer(std::uint32_t id) const { return value_of(integers, id); }
    [[nodiscard]] double fraction(std::uint32_t id) const { return value_of(fractions, id); }

private:
    template <class Number>
    static Number value_of(const std::vector<field<Number>>& fields, std::uint32_t id) {
        for (const auto& one : fields) {
            if (one.id == id) return one.value;
        }
        return Number{0};
    }
};

}  // namespace platform
