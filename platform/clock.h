// The host's clocks.
#pragma once

#include <chrono>
#include <cstdint>
#include <optional>

namespace platform {

// Current time of the monotonic clock, in ticks.
std::uint64_t ticks();

// Duration of a tick in seconds. Does not change while the process lives.
double tick_period();

// Sleeps for the whole duration. An interrupt wakes the sleep, its handler runs, and the sleep
// resumes.
void sleep(std::chrono::microseconds duration);

// A time since 1970, UTC.
struct calendar_instant {
    std::int64_t seconds;
    std::int64_t microseconds;
};

// The same instant on the monotonic clock and on the wall clock.
struct clock_reading {
    std::uint64_t ticks;
    calendar_instant wall;
};

// Reads both clocks at once.
clock_reading read_clocks();

// The time at which the host booted. Does not change while the process lives. Returns nullopt if
// the host does not provide it.
std::optional<calendar_instant> boot_time();

}  // namespace platform
