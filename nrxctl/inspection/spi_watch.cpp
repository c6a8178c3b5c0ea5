#include "nrxctl/inspection/spi_watch.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/spi_status.h"
#include "platform/hid_plugin.h"
#include "platform/registry.h"
#include "platform/run_loop.h"

namespace nrx {

namespace {

// A check whose report has a message.
bool check_step(bool holds, const char* condition, const char* message,
                platform::return_code code = platform::success,
                source_place place = source_place::here()) {
    if (!holds) {
        report_failure(library_label, condition, "bail", message, place.file, place.line, code);
    }
    return holds;
}

bool check_result(platform::return_code code, const char* message,
                  source_place place = source_place::here()) {
    return check_step(code == platform::success, "kr == 0 ", message, code, place);
}

platform::service find_device_of(std::int32_t service_id) {
    print_line(text_line().text("Found an id for service = ").number(service_id).view());
    return platform::first_match(match_hid_device(service_id));
}

void print_records(const platform::hid_interface& device, std::int32_t service_id,
                   std::uint32_t mode) {
    constexpr const char* no_callback = "Failed in adding callback";
    platform::return_code kr = platform::schedule_on_loop(device);
    if (!check_result(kr, no_callback)) return;
    kr = platform::set_record_callback(device, print_spi_status);
    if (!check_result(kr, no_callback)) return;
    kr = platform::set_mode(device, service_id, mode);
    if (!check_result(kr, "Failed in setting mode")) return;
    kr = platform::run_loop();
    check_success(kr, "kr == 0 ");
}

void switch_off(const platform::hid_interface& device, std::int32_t service_id) {
    const platform::return_code kr = platform::set_mode(device, service_id, 0);
    check_result(kr, "Failed in setting mode to OFF");
}

}  // namespace

platform::return_code watch_spi_status(std::int32_t service_id, std::uint32_t mode) {
    const platform::service service = find_device_of(service_id);
    if (!check_step(!!service, "service", "Service instance not found")) return platform::success;
    const platform::hid_plugin plugin = platform::create_hid_plugin(service);
    if (!check_step(!!plugin, "cfPlugInInterface", "Plugin Interface not found"))
        return platform::success;
    const platform::hid_interface device = platform::query_hid_interface(plugin);
    if (!check_step(!!device, "hidDeviceInterface", "HID Device Interface not found"))
        return platform::success;
    mode == 0 ? switch_off(device, service_id) : print_records(device, service_id, mode);
    return platform::success;
}

}  // namespace nrx
