// The host's clocks.
#pragma once

#include <chrono>
#include <cstdint>
#include <optional>

namespace platform {

// Ticks of the monotonic clock.
std::uint64_t ticks();

// Seconds from one tick to the next; the same for the whole life of the process.
double tick_period();

// Sleeps. The interrupt handler runs inside, and the sleep then goes on to its end.
void sleep(std::chrono::microseconds duration);

// An instant since 1970, UTC.
struct calendar_instant {
    std::int64_t seconds;
    std::int64_t microseconds;
};

// One instant on the monotonic clock and on the wall clock.
struct clock_reading {
    std::uint64_t ticks;
    calendar_instant wall;
};

// Reads both clocks at once.
clock_reading read_clocks();

// When the host was started: the same instant as long as the process lives. None if the host does
// not tell.
std::optional<calendar_instant> boot_time();

}  // namespace platform
