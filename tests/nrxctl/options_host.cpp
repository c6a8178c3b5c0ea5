#include "tests/nrxctl/options_host.h"

#include <chrono>
#include <cstdlib>
#include <ctime>

#include "nrxctl/base/clock_references.h"
#include "nrxctl/options/options.h"
#include "platform/clock.h"
#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist/parts.h"
#include "tests/support/argument_vector.h"

namespace tests {

options_host::options_host() : service(add_service(host, "x", 0x70)) {
    using namespace platform::simulated;
    add_interface_services(host);
    add_hid_devices(host);
    add_profiler(host);
    add_replay(host);
    add_named_properties(host);
    add_mca(host);
    add_button(host);
    add_diagnostic_reports(host);
    add_hid_events(host);
    host.clock().set_wall_start(std::chrono::seconds(1'000'000'000));
    host.set_boot_time({1'000'000'000, 0});
    add_time_sync(host, [] { return sync_point{0, 1'000'000'000'000'000'000}; });
    ::setenv("TZ", "UTC", 1);
    ::tzset();
    nrx::tick_period = platform::tick_period();
}

outcome options_host::run(const std::string& arguments) {
    argument_vector command_line(split("nrxctl " + arguments));
    int status = -1;
    auto result =
        capture([&] { status = nrx::nrxctl::run(command_line.argc(), command_line.argv()); });
    result.status = status;
    return result;
}

}  // namespace tests
