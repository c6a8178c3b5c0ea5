// Sensor inspection and watches with each of their platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include "nrxctl/inspection/hid_event_watch.h"
#include "nrxctl/inspection/spi_watch.h"
#include "platform/run_loop.h"
#include "tests/inspection/sensor_host.h"
#include "tests/support/hid_host.h"
#include "tests/support/report_bytes.h"

namespace tests {

using namespace std::chrono_literals;

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    add_sensor(*host, "accel");
    add_hid_interfaces(*host, {"one", "two"});
    add_hid_device(*host, "accel-hid", 16).script = {{10ms, report_with(9, {{8, 1, 1}})}};
    set_hid_events_script(*host, {{10ms, platform::simulated::hid_reset{}}});
    host->clock().run_at(20ms, platform::stop_loop);
    return host;
}

TEST(inspection_fault_sweep, failed_call_is_reported_or_optional) {
    // Reports are optional, and a service may be found by another lookup.
    const std::string sensor_calls = "^(first match|call|property of) ";
    sweep_faults(make_host, {{[] { nrx::print_sensor_info("accel", 1); }, sensor_calls},
                             {[] { nrx::print_sensor_info("accel", 2); }, sensor_calls},
                             {[] { nrx::print_sensor_info("nobody", 1); }, "^first match "},
                             {[] { nrx::watch_spi_status(16, 0); }},
                             {[] { nrx::watch_spi_status(16, 1); }},
                             {[] { nrx::watch_hid_events(std::nullopt); }, "^services of "}});
}

}  // namespace tests
