#include "nrxctl/inspection/sensor_reports.h"

#include "nrxctl/base/command_channel.h"

namespace nrx {

namespace {

struct property_row {
    sensor_property property;
    sensor_report report;
};

using enum sensor_property;

constexpr std::array<property_row, sensor_property_count> property_rows{{
    {sample_interval, {0x00, 4}},
    {hardware_interval, {0x33, 4, -1}},
    {tick_interval, {0x40, 4, -1}},
    {filter, {0x22, 4}},
    {fixed_rate, {0x23, 4}},
    {decimation, {0x24, 4}},
    {batching, {0x43, 20}},
    {raw_mode, {0x0a, 4}},
    {factory_mode, {0x0d, 4}},
    {vendor, {0x0f, 32, 0, reply_length::variable}},
    {model, {0x10, 32, 0, reply_length::variable}},
    {calibration_matrix, {0x0b, 36}},
    {calibration_offset, {0x1a, 12}},
    {orientation, {0x18, 9}},
    {sample_intervals, {0x3f, 128, 0, reply_length::variable}},
    {startup_time, {0x2d, 4}},
    {internal_calibration, {0x19, 4}},
    {calibration_source, {0x3d, 4}},
    {location, {0x44, 5}},
}};

}  // namespace

sensor_reply read_sensor_report(std::string_view service_name, const sensor_report& report) {
    std::vector<std::uint8_t> buffer(report.capacity);
    platform::byte_span bytes = buffer;
    const platform::return_code kr = get_report_quiet(service_name, report.id, bytes);
    if (kr != platform::success) return {kr, {}, report.failure_value};
    if (report.length == reply_length::fixed) check_length(bytes, report.capacity);
    return {kr, {bytes.begin(), bytes.end()}, report.failure_value};
}

platform::return_code sensor_properties::read(std::string_view service_name) {
    for (const property_row& row : property_rows) {
        sensor_reply& reply = replies_[static_cast<std::size_t>(row.property)];
        reply = read_sensor_report(service_name, row.report);
        if (row.property == sample_interval && !reply.was_read()) return reply.result();
    }
    return platform::success;
}

}  // namespace nrx
