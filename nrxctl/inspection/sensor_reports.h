// The property reports of a sensor service: small ones, and all optional but the first.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <utility>
#include <vector>

#include "nrxctl/base/reply_fields.h"
#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Whether a reply that leaves room unused lacks something (numbers), or is what it is (texts,
// lists).
enum class reply_extent { fixed, variable };

struct sensor_report {
    std::uint32_t id;
    std::size_t size;                // the room for the reply, in bytes
    std::int32_t failure_value = 0;  // each number of a report that was not read
    reply_extent extent = reply_extent::fixed;
};

// What a sensor answered to the request for a report; nothing read, at first.
class sensor_reply {
public:
    // A reply that was not read has no bytes.
    sensor_reply() = default;
    sensor_reply(platform::return_code result, std::vector<std::uint8_t> bytes,
                 std::int32_t failure_value)
        : result_(result), bytes_(std::move(bytes)), failure_value_(failure_value) {}

    [[nodiscard]] platform::return_code result() const { return result_; }
    [[nodiscard]] bool was_read() const { return result_ == platform::success; }
    [[nodiscard]] platform::byte_view bytes() const { return bytes_; }

    // The little-endian number at an offset: the failure value if the report was not read, 0 if the
    // number is not wholly inside the reply.
    template <class Number>
    [[nodiscard]] Number number(std::size_t offset = 0) const {
        return was_read() ? reply_fields(bytes_).number<Number>(offset)
                          : static_cast<Number>(failure_value_);
    }
    [[nodiscard]] std::int32_t s32(std::size_t offset = 0) const {
        return number<std::int32_t>(offset);
    }
    [[nodiscard]] bool is_set() const { return s32() != 0; }

    // How many whole 32-bit numbers the reply holds.
    [[nodiscard]] std::size_t count_of_words() const {
        return bytes_.size() / sizeof(std::uint32_t);
    }

private:
    platform::return_code result_ = platform::not_found;
    std::vector<std::uint8_t> bytes_;
    std::int32_t failure_value_ = 0;
};

// Reads a report. That the service is missing or does not answer is not reported; that it cannot be
// opened is, and a reply too short for a report of a fixed size.
sensor_reply read_sensor_report(std::string_view service_name, const sensor_report& report);

// What every sensor may tell about itself, in the order in which it is asked.
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
    calibration_matrix,    // nine s32 with 16 fraction bits, row by row
    calibration_offset,    // three s32
    orientation,           // nine s8, row by row
    sample_intervals,      // those supported: u32, microseconds each
    startup_time,          // s32
    internal_calibration,  // s32, at 100 Hz
    calibration_source,    // u32: uncalibrated, default, sysconfig
    location,              // a character (0: none), then the alternate index, s32
};

inline constexpr std::size_t sensor_property_count =
    static_cast<std::size_t>(sensor_property::location) + 1;

class sensor_properties {
public:
    // Asks a sensor for its properties, one after the other; for none but the sample interval if
    // that cannot be read, with its code as the result.
    platform::return_code read(std::string_view service_name);

    [[nodiscard]] const sensor_reply& operator[](sensor_property which) const {
        return replies_[static_cast<std::size_t>(which)];
    }

private:
    std::array<sensor_reply, sensor_property_count> replies_;
};

}  // namespace nrx
