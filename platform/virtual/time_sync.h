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

// Registers the time-sync service of a coprocessor whose times now tells. Whoever reads its
// property gets a sync point of the current second of the coprocessor's time, taken when the first
// one in that second read it.
void add_time_sync(machine& host, std::function<sync_point()> now);

}  // namespace platform::simulated
