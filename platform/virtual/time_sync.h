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

// Registers the time-sync service of a coprocessor whose times now tells. As the coprocessor's time
// goes on, it publishes a sync point a second.
void add_time_sync(machine& host, std::function<sync_point()> now);

}  // namespace platform::simulated
