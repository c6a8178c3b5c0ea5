#include "nrxctl/inspection/sensor_summary.h"

#include <array>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/field_text.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/value_lists.h"

namespace nrx {

namespace {

using enum sensor_property;

std::string_view enabled_or_not(const sensor_reply& flag) {
    return flag.is_set() ? "enabled" : "disabled";
}

void print_identity(std::string_view service_name, const sensor_properties& sensor) {
    print_line(text_line().text("Sensor type : ").text(service_name).view());
    print_line(text_line()
                   .text("Device      : ")
                   .text(text_before_nul(sensor[vendor].bytes()))
                   .text(" ")
                   .text(text_before_nul(sensor[model].bytes()))
                   .view());
}

void print_location(const sensor_reply& reply) {
    constexpr std::size_t alternate_offset = 1;
    const char place = reply.number<char>(0);
    if (place == 0) return print_line("Location    : N/A");
    text_line line;
    line.text("Location    : '").text({&place, 1}).text("' alternate=");
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
        print_line(line.text(" decimation=").text(enabled_or_not(sensor[decimation])).view());
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
    line.text("Filter      : ").text(enabled_or_not(sensor[filter]));
    print_line(line.text(" fixedOdr=").text(enabled_or_not(sensor[fixed_rate])).view());
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
    constexpr std::array<std::string_view, 3> sources{"uncalibrated", "default", "sysconfig"};
    const auto source = sensor[calibration_source].number<std::uint32_t>();
    text_line line;
    line.text("Calibrated  : ");
    if (source < sources.size()) {
        line.text(sources[source]);
    } else {
        line.number(static_cast<std::int32_t>(source));
    }
    print_line(line.view());
    if (const sensor_reply& matrix = sensor[calibration_matrix]; matrix.was_read()) {
        line.clear();
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

// The supported intervals, as rates in Hz.
void print_rates(const sensor_reply& intervals) {
    constexpr double microseconds_per_second = 1000000.0;
    constexpr int digits = 2;
    text_line line;
    line.text("SampleRates : ");
    for (std::size_t i = 0; i < intervals.count_of_words(); ++i) {
        const auto interval = intervals.number<std::uint32_t>(i * sizeof(std::uint32_t));
        line.fixed(microseconds_per_second / interval, digits).text(" ");
    }
    print_line(line.view());
}

}  // namespace

void print_sensor_summary(std::string_view service_name, const sensor_properties& sensor) {
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

}  // namespace nrx
