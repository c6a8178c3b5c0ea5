// The wrist device keeps the time of the host that it runs on: the coprocessor's time is the host's
// monotonic clock, the calendar its wall clock.

#include <chrono>

#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

using std::chrono::duration_cast;

template <class Clock>
std::int64_t nanoseconds_of(typename Clock::time_point instant) {
    return duration_cast<std::chrono::nanoseconds>(instant.time_since_epoch()).count();
}

sync_point host_times() {
    return {nanoseconds_of<std::chrono::steady_clock>(std::chrono::steady_clock::now()),
            nanoseconds_of<std::chrono::system_clock>(std::chrono::system_clock::now())};
}

// The calendar at the zero of the monotonic clock, which the host's start is.
calendar_instant boot_instant() {
    const sync_point now = host_times();
    const std::int64_t microseconds = (now.calendar - now.coprocessor) / 1000;
    return {microseconds / 1000000, microseconds % 1000000};
}

}  // namespace

void add_clocks(machine& device) {
    device.set_boot_time(boot_instant());
    add_time_sync(device, host_times);
}

}  // namespace platform::simulated
