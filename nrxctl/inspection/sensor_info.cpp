#include "nrxctl/inspection/sensor_info.h"

#include <array>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/name_table.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/services.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/client_table.h"
#include "nrxctl/inspection/sensor_details.h"
#include "nrxctl/inspection/sensor_registry.h"
#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

namespace {

using enum sensor_property;

// Lists of numbers

constexpr std::size_t number_size = sizeof(std::int32_t);
constexpr std::size_t matrix_row_size = 3 * number_size;

void append_fraction(text_line& line, const sensor_reply& reply, std::size_t offset) {
    constexpr int digits = 6;
    line.fixed(reply.s32(offset) / q16_16_one, digits);
}

void append_vector_at(text_line& line, const sensor_reply& reply, std::size_t offset) {
    append_fraction(line, reply, offset);
    append_fraction(line.text(" "), reply, offset + number_size);
    append_fraction(line.text(" "), reply, offset + 2 * number_size);
}

void append_vector(text_line& line, const sensor_reply& reply) {
    append_vector_at(line, reply, 0);
}

void append_matrix(text_line& line, const sensor_reply& reply) {
    append_vector_at(line, reply, 0);
    append_vector_at(line.text(" | "), reply, matrix_row_size);
    append_vector_at(line.text(" | "), reply, 2 * matrix_row_size);
}

void append_number(text_line& line, const sensor_reply& reply) {
    line.number(reply.s32());
}

void append_numbers(text_line& line, const sensor_reply& reply) {
    for (std::size_t i = 0; i < reply.number_count(); ++i)
        line.number(reply.s32(i * number_size)).text(" ");
}

// Sensors of all kinds

std::string_view enabled_or_disabled(const sensor_reply& flag) {
    return flag.is_set() ? "enabled" : "disabled";
}

void print_identity(std::string_view service_name, const sensor_properties& sensor) {
    print_line(text_line().text("Sensor type : ").text(service_name).view());
    text_line line;
    line.text("Device      : ").text(text_before_nul(sensor[vendor].bytes()));
    print_line(line.text(" ").text(text_before_nul(sensor[model].bytes())).view());
}

void print_location(const sensor_reply& reply) {
    constexpr std::size_t alternate_offset = 1;
    const char letter = reply.number<char>();
    if (letter == 0) return print_line("Location    : N/A");
    text_line line;
    line.text("Location    : '").text({&letter, 1}).text("' alternate=");
    print_line(line.number(reply.s32(alternate_offset)).view());
}

void print_intervals(const sensor_properties& sensor) {
    constexpr std::uint32_t unsupported_interval = 0xffffffff;
    if (sensor[sample_interval].number<std::uint32_t>() == unsupported_interval) {
        print_line("Sample intvl: unsupported");
    } else {
        text_line line;
        line.text("Sample intvl: ").number(sensor[sample_interval].s32());
        line.text(" us, hw=").number(sensor[hardware_interval].s32());
        print_line(line.text(" decimation=").text(enabled_or_disabled(sensor[decimation])).view());
    }
    const std::int32_t tick = sensor[tick_interval].s32();
    if (tick == -1) return print_line("Systck intvl: sensor is not systick source");
    print_line(text_line().text("Systck intvl: ").number(tick).text(" us").view());
}

void print_batching(const sensor_reply& reply) {
    text_line line;
    line.text("Batching    : sensor=").number(reply.s32(0));
    line.text(" mux=").number(reply.s32(4));
    line.text(" ap_batch=").number(reply.s32(8));
    line.text(" ap_report=").number(reply.s32(12));
    print_line(line.text(" (").number(reply.s32(16)).text(" samples in endpoint)").view());
}

void print_modes(const sensor_properties& sensor) {
    const char* mode = sensor[factory_mode].is_set() ? "factory" : "normal";
    if (sensor[raw_mode].is_set()) mode = "raw";
    print_line(text_line().text("Sensor mode : ").text(mode).view());
    text_line line;
    line.text("Filter      : ").text(enabled_or_disabled(sensor[filter]));
    print_line(line.text(" fixedOdr=").text(enabled_or_disabled(sensor[fixed_rate])).view());
}

constexpr std::array calibration_source_rows{
    name_row{0, "uncalibrated"},
    name_row{1, "default"},
    name_row{2, "sysconfig"},
};
constexpr name_table calibration_sources(calibration_source_rows);

// A source without a name prints as its number, signed.
void print_calibration_source(const sensor_reply& reply) {
    text_line line;
    line.text("Calibrated  : ");
    const std::string_view* name = calibration_sources.find(reply.number<std::uint32_t>());
    name != nullptr ? line.text(*name) : line.number(reply.s32());
    print_line(line.view());
}

void print_orientation(const sensor_reply& reply) {
    text_line line;
    line.text("Orient. m.  : ");
    for (std::size_t i = 0; i < 9; ++i) {
        if (i > 0) line.text(i % 3 == 0 ? ", " : " ");
        line.number(int{reply.number<std::int8_t>(i)});
    }
    print_line(line.view());
}

void print_calibration(const sensor_properties& sensor) {
    print_calibration_source(sensor[calibration_source]);
    text_line line;
    if (const sensor_reply& matrix = sensor[calibration_matrix]; matrix.was_read()) {
        append_matrix(line.text("Cal matrix  : "), matrix);
        print_line(line.view());
    }
    if (const sensor_reply& offset = sensor[calibration_offset]; offset.was_read()) {
        line.clear();
        line.text("Cal offset  : ").number(offset.s32(0)).text(" ").number(offset.s32(4));
        print_line(line.text(" ").number(offset.s32(8)).view());
    }
    if (sensor[orientation].was_read()) print_orientation(sensor[orientation]);
}

// Prints intervals as rates in Hz.
void print_rates(const sensor_reply& intervals) {
    constexpr double microseconds_per_second = 1000000.0;
    constexpr int digits = 2;
    text_line line;
    line.text("SampleRates : ");
    for (std::size_t i = 0; i < intervals.number_count(); ++i) {
        const auto interval = intervals.number<std::uint32_t>(i * number_size);
        line.fixed(microseconds_per_second / interval, digits).text(" ");
    }
    print_line(line.view());
}

// The calibration matrix, the calibration offset and the orientation have no line if they were not
// read; all other properties show their failure value.
void print_properties(std::string_view service_name, const sensor_properties& sensor) {
    print_identity(service_name, sensor);
    print_location(sensor[location]);
    print_intervals(sensor);
    print_batching(sensor[batching]);
    print_modes(sensor);
    print_calibration(sensor);
    print_rates(sensor[sample_intervals]);
    print_line(text_line().text("StartupTime : ").number(sensor[startup_time].s32()).view());
    const std::int32_t calibration = sensor[internal_calibration].s32();
    print_line(text_line().text("intCal      : ").number(calibration).text(" [at 100Hz]").view());
}

// Motion sensors

void append_bandwidth(text_line& line, const sensor_reply& reply) {
    reply.is_set() ? line.number(reply.s32()) : line.text("auto");
}

struct motion_row {
    std::string_view service_name;
    std::string_view label;
    sensor_report report;
    void (*append)(text_line& line, const sensor_reply& reply);
    std::string_view failure_text = {};  // stands in for a report that cannot be read
};

constexpr sensor_report full_scale{0x06, 4};
constexpr sensor_report full_scales{0x36, 128, 0, reply_length::variable};
constexpr sensor_report bandwidth{0x04, 4};
constexpr sensor_report bandwidths{0x37, 128, 0, reply_length::variable};
constexpr sensor_report sensitivity{0x1d, 36};
constexpr sensor_report compensation{0xd6, 12};

constexpr std::array motion_rows{
    motion_row{"accel", "fsr         : ", full_scale, append_number},
    motion_row{"accel", "SupportedFSR: ", full_scales, append_numbers},
    motion_row{"accel", "bw          : ", bandwidth, append_bandwidth},
    motion_row{"accel", "SupportedBW : ", bandwidths, append_numbers},
    motion_row{"gyro", "range       : ", full_scale, append_number},
    motion_row{"gyro", "SupportedRanges: ", full_scales, append_numbers},
    motion_row{"compass", "Sensitivity : ", sensitivity, append_matrix, "N/A"},
    motion_row{"compass", "Compensation: ", compensation, append_vector, "N/A"},
};

void print_motion_properties(std::string_view service_name) {
    for (const motion_row& row : motion_rows) {
        if (row.service_name != service_name) continue;
        text_line line;
        line.text(row.label);
        const sensor_reply reply = read_sensor_report(service_name, row.report);
        if (reply.was_read()) {
            row.append(line, reply);
        } else {
            line.text(row.failure_text);
        }
        print_line(line.view());
    }
}

// The parts of the output

constexpr std::int32_t detailed_level = 2;

void print_read_failure(std::string_view service_name, platform::return_code kr) {
    text_line line;
    line.text("sensor ").text(service_name).text(" doesn't provide sensor info (kr=");
    print_failure(line.hex(static_cast<std::uint32_t>(kr)).text(")\n").view());
    if (kr != platform::not_found) return;
    print_hid_services(service_name);
    explain_missing_service(service_name);
}

void print_details(std::string_view service_name) {
    print_client_table("Clients     : ", service_name);
    print_extra_info(service_name);
    print_register_list(service_name);
    print_perf_counters(service_name);
    print_event_statistics(service_name);
}

}  // namespace

void print_sensor_info(std::string_view service_name, std::int32_t level) {
    sensor_properties sensor;
    const platform::return_code kr = sensor.read(service_name);
    if (kr != platform::success) return print_read_failure(service_name, kr);
    print_properties(service_name, sensor);
    print_motion_properties(service_name);
    if (level == detailed_level) print_details(service_name);
    print_line("\n");
}

}  // namespace nrx
