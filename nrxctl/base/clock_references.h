// The tick period and the reference instants with which times are computed, process-wide. A front
// end sets them from the platform before it starts a monitor or prints HID events; they are 0
// before.
#pragma once

namespace nrx {

// Seconds per tick of the platform's monotonic clock.
extern double tick_period;

// One instant, in seconds: on the wall clock, since 1970, and on the monotonic clock, as ticks
// times the tick period. Both come from one reading.
extern double wall_reference;
extern double monotonic_reference;

}  // namespace nrx
