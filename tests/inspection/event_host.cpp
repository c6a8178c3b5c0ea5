#include "tests/inspection/event_host.h"

#include <cmath>
#include <sstream>

#include "nrxctl/base/tick_period.h"
#include "nrxctl/inspection/clock_references.h"
#include "nrxctl/inspection/event_stream.h"
#include "nrxctl/inspection/hid_event_times.h"
#include "nrxctl/inspection/hid_events.h"

namespace tests {

void forget_events() {
    nrx::tick_period = 1e-6;
    nrx::wall_reference = 0;
    nrx::monotonic_reference = 0;
    nrx::first_event_time = 0;
    nrx::last_event_time = 0;
    nrx::last_wall_time = 0;
    nrx::event_stream().copyfmt(std::ostringstream());
}

platform::hid_event event_at(double time, std::uint32_t type) {
    return {.ticks = static_cast<std::uint64_t>(std::llround(time * 1e6)), .type = type};
}

platform::hid_event vendor_event_at(double time, const std::string& data) {
    auto event = event_at(time, platform::vendor_defined_event);
    event.vendor_data.assign(data.begin(), data.end());
    return event;
}

std::string printed_event(const platform::hid_event& event, const std::string& label) {
    const outcome result = capture([&] { nrx::print_hid_event(event, label); });
    EXPECT_EQ(result.err, "");
    return result.out;
}

}  // namespace tests
