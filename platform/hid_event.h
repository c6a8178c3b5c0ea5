// Events of the host's HID event system.
#pragma once

#include <cstdint>
#include <vector>

namespace platform {

// Event types.
inline constexpr std::uint32_t null_event = 0;
inline constexpr std::uint32_t vendor_defined_event = 1;
inline constexpr std::uint32_t accelerometer_event = 13;

// Fields of an accelerometer event: three reals, then three integers.
inline constexpr std::uint32_t accelerometer_x = 0xd0000;
inline constexpr std::uint32_t accelerometer_y = 0xd0001;
inline constexpr std::uint32_t accelerometer_z = 0xd0002;
inline constexpr std::uint32_t accelerometer_type = 0xd0003;
inline constexpr std::uint32_t accelerometer_subtype = 0xd0004;
inline constexpr std::uint32_t accelerometer_sequence = 0xd0005;

// An event. Copies share nothing with the original.
struct hid_event {
    template <class Number>
    struct field {
        std::uint32_t id;
        Number value;
    };

    // Time of the event, in ticks of the monotonic clock.
    std::uint64_t ticks = 0;
    std::uint32_t type = null_event;
    // Time from the event to its delivery.
    std::int64_t latency_nanoseconds = 0;
    std::vector<field<std::int64_t>> integers = {};
    std::vector<field<double>> reals = {};
    // Payload of a vendor-defined event.
    std::vector<std::uint8_t> vendor_data = {};

    // The latency in units of scale nanoseconds, rounded towards 0; scale is positive.
    [[nodiscard]] std::int64_t latency(std::int64_t scale) const {
        return latency_nanoseconds / scale;
    }

    // Value of a field; 0 if the event has no such field.
    [[nodiscard]] std::int64_t integer(std::uint32_t id) const { return value_of(integers, id); }
    [[nodiscard]] double real(std::uint32_t id) const { return value_of(reals, id); }

private:
    template <class Number>
    static Number value_of(const std::vector<field<Number>>& fields, std::uint32_t id) {
        for (const auto& candidate : fields) {
            if (candidate.id == id) return candidate.value;
        }
        return Number{0};
    }
};

}  // namespace platform
