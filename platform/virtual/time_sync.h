// The service that tells how the coprocessor's time and the calendar belong together.
#pragma once

#include <cstdint>
#include <functional>

#include "platform/virtual/machine.h"

namespace platform::simulated {

// One instant in both times.
struct sync_point {
    std::int64_t coprocessor;  // nanoseconds of the coprocessor's time
    std::int64_t calendar;     // nanoseconds since 1970, UTC
};

// Registers a time-sync service. now tells the current instant in both times. The sync point that
// the service publishes is taken anew when it is read, but at most once in a second of the
// coprocessor's time.
void add_time_sync(machine& host, std::function<sync_point()> now);

}  // namespace platform::simulated
