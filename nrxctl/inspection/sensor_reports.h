// The property reports of a sensor service. They are small, and all but the first are optional.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <utility>
#include <vector>

#include "nrxctl/base/identifiers.h"
#include "nrxctl/base/reply_fields.h"
#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Whether a reply must fill its buffer (numbers), or may be shorter (texts, lists).
enum class reply_length { fixed, variable };

struct sensor_report {
    report_id id;
    std::size_t capacity;            // of the buffer for the reply, in bytes
    std::int32_t failure_value = 0;  // stands in for each number if the report cannot be read
    reply_length length = reply_length::fixed;
};

// The reply of a sensor to the request for a report.
class sensor_reply {
public:
    // A reply that has not been read: it has no bytes.
    sensor_reply() = default;
    sensor_reply(platform::return_code result, std::vector<std::uint8_t> bytes,
                 std::int32_t failure_value)
        : result_(result), bytes_(std::move(bytes)), failure_value_(failure_value) {}

    [[nodiscard]] platform::return_code result() const { return result_; }
    [[nodiscard]] bool was_read() const { return result_ == platform::success; }
    [[nodiscard]] platform::byte_view bytes() const { return bytes_; }

    // Returns the little-endian number at an offset: the failure value if the report was not read,
    // 0 if the number is not wholly inside the reply.
    template <class Number>
    [[nodiscard]] Number number(std::size_t offset = 0) const {
        return was_read() ? reply_fields(bytes_).number<Number>(offset)
                          : static_cast<Number>(failure_value_);
    }
    [[nodiscard]] std::int32_t s32(std::size_t offset = 0) const {
        return number<std::int32_t>(offset);
    }
    [[nodiscard]] bool is_set() const { return s32() != 0; }

    // The number of complete 32-bit numbers in the reply.
    [[nodiscard]] std::size_t number_count() const { return bytes_.size() / sizeof(std::uint32_t); }

private:
    platform::return_code result_ = platform::not_found;
    std::vector<std::uint8_t> bytes_;
    std::int32_t failure_value_ = 0;
};

// Reads a report. A service that is missing or does not reply is not reported; one that cannot be
// opened is, and so is a reply too short for a report of fixed length.
sensor_reply read_sensor_report(std::string_view service_name, const sensor_report& report);

// The properties of a sensor, in the order in which they are read.
enum class sensor_property {
    sample_interval,       // u32, microseconds; all bits set: unsupported
    hardware_interval,     // s32
    tick_interval,         // s32, microseconds; -1: no source of system ticks
    filter,                // u32, a flag
    fixed_rate,            // u32, a flag
    decimation,            // u32, a flag
    batching,              // five s32: sensor, mux, ap_batch, ap_report, samples in the endpoint
    raw_mode,              // u32, a flag
    factory_mode,          // u32, a flag
    vendor,                // text
    model,                 // text
    calibration_matrix,    // nine q16.16 numbers, row by row
    calibration_offset,    // three s32
    orientation,           // nine s8, row by row
    sample_intervals,      // those supported: u32, microseconds each
    startup_time,          // s32
    internal_calibration,  // s32, at 100 Hz
    calibration_source,    // u32: uncalibrated, default, sysconfig
    location,              // a character (0: none), then the alternate index, s32
    count,
};

inline constexpr auto sensor_property_count = static_cast<std::size_t>(sensor_property::count);

class sensor_properties {
public:
    // Reads all properties of a sensor. If the sample interval cannot be read, stops there and
    // fails with the platform's code.
    platform::return_code read(std::string_view service_name);

    [[nodiscard]] const sensor_reply& operator[](sensor_property property) const {
        return replies_[static_cast<std::size_t>(property)];
    }

private:
    std::array<sensor_reply, sensor_property_count> replies_;
};

}  // namespace nrx
