// The service that relates the coprocessor's time to the calendar.
#pragma once

#include <cstdint>
#include <functional>

#include "platform/virtual/machine.h"

namespace platform::simulated {

// The same instant in both times.
struct sync_point {
    std::int64_t coprocessor;  // nanoseconds of the coprocessor's clock
    std::int64_t calendar;     // nanoseconds since 1970, UTC
};

// Registers a time-sync service. now returns the current instant in both times. The service renews
// its published sync point when it is read, but at most once per second of the coprocessor's clock.
void add_time_sync(machine& host, std::function<sync_point()> now);

}  // namespace platform::simulated
