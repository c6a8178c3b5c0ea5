// The wrist device keeps the time of the host that it runs on: the coprocessor's time is the host's
// monotonic clock, the calendar its wall clock.

#include <ctime>

#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

std::int64_t nanoseconds_of(clockid_t clock) {
    timespec now{};
    ::clock_gettime(clock, &now);
    return std::int64_t{now.tv_sec} * 1000000000 + now.tv_nsec;
}

// Both clocks at the host's last tick, which is the same instant for both.
sync_point last_tick() {
    sync_point point{};
    do {
        point.coprocessor = nanoseconds_of(CLOCK_MONOTONIC_COARSE);
        point.calendar = nanoseconds_of(CLOCK_REALTIME_COARSE);
    } while (point.coprocessor != nanoseconds_of(CLOCK_MONOTONIC_COARSE));
    return point;
}

calendar_instant boot_instant() {
    constexpr std::int64_t microseconds_per_second = 1000000;
    const std::int64_t booted =
        (nanoseconds_of(CLOCK_REALTIME) - nanoseconds_of(CLOCK_BOOTTIME)) / 1000;
    return {booted / microseconds_per_second, booted % microseconds_per_second};
}

}  // namespace

void add_clocks(machine& device) {
    device.set_boot_time(boot_instant());
    add_time_sync(device, last_tick);
}

}  // namespace platform::simulated
