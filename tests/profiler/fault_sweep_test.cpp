// Every operation of the profiler family survives the failure of any platform call.
#include "tests/support/fault_sweep.h"

#include "nrxctl/base/clock_references.h"
#include "nrxctl/profiler/profile_command.h"
#include "nrxctl/profiler/scm_monitor.h"
#include "platform/clock.h"
#include "platform/virtual/profiler/profiler.h"
#include "tests/support/argument_vector.h"
#include "tests/support/device_test.h"
#include "tests/support/rows.h"

namespace tests {

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    serve_profile(add_service(*host, "profile", 1), add_profiler_driver(*host));
    return host;
}

TEST(profiler_fault_sweep, failed_call_is_reported_and_leaves_nothing_open) {
    nrx::tick_period = platform::tick_period();
    // Calls that may fail without a report, as the log writes them.
    const std::string prefixed_lookup = "IONameMatch = \"WQR_";
    const std::string lookups = "IONameMatch = \"(WQR_|profile\")";
    const std::string driver_lookup = lookups + "|IONameMatch = \"KeltoNRXProfileDriver\"";
    const std::string waits = lookups + "|sleep |data available ";
    const std::string record_times = "|KeltoNRXTimesync|boot time";
    // What is printed instead of a report.
    const std::string refusals("config: At least one config failed|Can't enable SCM profiler");
    for (const auto& [command_lines, silent_calls] : rows<std::string, std::string>{
             {"enable;disable", "none"},
             {"clear-eventsources;eventsources;wqrfw-wakestats;on-error panic", prefixed_lookup},
             {"stop;flush;config sensor:accel", lookups},
             {"get-config", lookups + "|KeltoNRXProfileDriver 3|open profile|call profile"},
             {"signal-errdump;get-logs errdump fwdump", driver_lookup},
             {"get-logs human", driver_lookup + record_times},
             {"40 sensor:accel;40 scm:spi0:ch0", waits},
             {"monitor human 40", waits + record_times}}) {
        for (const std::string& command_line : split(command_lines, ';')) {
            const argument_vector arguments(split(command_line));
            const bool is_scm = command_line.find("scm:") != std::string::npos;
            const auto operation = [&] {
                int index = 1;
                (is_scm ? nrx::scm_monitor : nrx::profile_command)(arguments.span()[0],
                                                                   arguments.span(), index);
            };
            sweep_faults(make_host, {{operation, silent_calls, refusals}});
        }
    }
}

}  // namespace tests
