// The profiler, as it stands after a start of the device: nothing is profiled yet.

#include "platform/virtual/profiler/profiler.h"

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

void add_profiler(machine& device, std::uint32_t events_per_second) {
    const auto shared = add_profiler_driver(device);
    shared->stream()->set_rate(events_per_second);
    shared->dump_errors();
    serve_profile(interface_of(device, "profile"), shared);
}

}  // namespace platform::simulated
