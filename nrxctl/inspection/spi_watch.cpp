#include "nrxctl/inspection/spi_watch.h"

#include <string>

#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/base/services.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/spi_status.h"
#include "platform/hid_plugin.h"
#include "platform/registry.h"
#include "platform/run_loop.h"

namespace nrx {

namespace {

// Like check, but with a message in the failure report.
bool check_step(bool holds, const char* condition, const char* message,
                platform::return_code code = platform::success,
                source_location location = source_location::current()) {
    if (!holds) {
        report_failure(library_label, condition, "bail", message, location.file, location.line,
                       code);
    }
    return holds;
}

bool check_result(platform::return_code code, const char* message,
                  source_location location = source_location::current()) {
    return check_step(code == platform::success, condition::kr_is_zero, message, code, location);
}

void watch_records(const platform::hid_interface& device, service_id id, std::uint32_t mode) {
    const limited_watch limited;
    constexpr const char* callback_failure = "Failed in adding callback";
    platform::return_code kr = platform::schedule_on_loop(device);
    if (!check_result(kr, callback_failure)) return;
    kr = platform::set_record_callback(device, print_spi_status);
    if (!check_result(kr, callback_failure)) return;
    kr = platform::set_mode(device, id, mode);
    if (!check_result(kr, "Failed in setting mode")) return;
    flush_output();
    kr = platform::run_loop();
    check_success(kr, condition::kr_is_zero);
}

void disable(const platform::hid_interface& device, service_id id) {
    const platform::return_code kr = platform::set_mode(device, id, 0);
    check_result(kr, "Failed in setting mode to OFF");
}

}  // namespace

platform::return_code watch_spi_status(service_id id, std::uint32_t mode) {
    print_line(text_line().text("Found an id for service = ").number(id).view());
    const platform::service service = platform::first_match(match_hid_device(id));
    if (!service)
        explain(
            [&] { return explanation{"service " + std::to_string(id) + " has no HID device"}; });
    if (!check_step(!!service, condition::service, "Service instance not found"))
        return platform::success;
    const platform::hid_plugin plugin = platform::create_hid_plugin(service);
    if (!check_step(!!plugin, "cfPlugInInterface", "Plugin Interface not found"))
        return platform::success;
    const platform::hid_interface device = platform::query_hid_interface(plugin);
    if (!check_step(!!device, "hidDeviceInterface", "HID Device Interface not found"))
        return platform::success;
    mode == 0 ? disable(device, id) : watch_records(device, id, mode);
    return platform::success;
}

}  // namespace nrx
