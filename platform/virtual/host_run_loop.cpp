// The event loop of the virtual host.

#include <string>

#include "platform/run_loop.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::machine;

return_code run_loop() {
    machine& host = current_machine();
    const auto how = host.begin_call([] { return std::string("run loop"); });
    if (how) return code_of(*how);
    return host.loop().run(host.clock(), std::nullopt);
}

return_code run_loop_for(std::chrono::microseconds duration) {
    machine& host = current_machine();
    const auto how =
        host.begin_call([&] { return "run loop for " + std::to_string(duration.count()) + " us"; });
    if (how) return code_of(*how);
    return host.loop().run(host.clock(), host.clock().now() + duration);
}

void stop_loop() {
    current_machine().loop().stop();
}

}  // namespace platform
