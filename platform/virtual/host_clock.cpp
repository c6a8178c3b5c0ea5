// The clocks of the virtual host.

#include "platform/clock.h"
#include "platform/virtual/machine.h"

namespace platform {

std::optional<calendar_instant> boot_time() {
    simulated::machine& host = simulated::current_machine();
    if (host.begin_call([] { return std::string("boot time"); })) return std::nullopt;
    return host.boot_time();
}

}  // namespace platform
