#include "nrxctl/inspection/sensor_info.h"

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/client_table.h"
#include "nrxctl/inspection/event_statistics.h"
#include "nrxctl/inspection/extra_info.h"
#include "nrxctl/inspection/hid_service_list.h"
#include "nrxctl/inspection/motion_sensor.h"
#include "nrxctl/inspection/perf_counters.h"
#include "nrxctl/inspection/register_list.h"
#include "nrxctl/inspection/sensor_reports.h"
#include "nrxctl/inspection/sensor_summary.h"

namespace nrx {

namespace {

constexpr std::int32_t detailed_level = 2;

void print_no_info(std::string_view service_name, platform::return_code kr) {
    text_line line;
    line.text("sensor ").text(service_name).text(" doesn't provide sensor info (kr=");
    print_line(line.hex(static_cast<std::uint32_t>(kr)).text(")\n").view());
    if (kr == platform::not_found) print_hid_services(service_name);
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
    if (kr != platform::success) return print_no_info(service_name, kr);
    print_sensor_summary(service_name, sensor);
    print_motion_sensor(service_name);
    if (level == detailed_level) print_details(service_name);
    print_line("\n");
}

}  // namespace nrx
