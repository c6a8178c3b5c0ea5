// What the printer of HID events measures by, process-wide; tick_period.h has the tick of the
// monotonic clock, which a front end sets as well.
#pragma once

namespace nrx {

// One instant, in seconds: on the wall clock, since 1970, and on the monotonic clock, as ticks
// times the tick period. A front end sets both from one reading before it prints events; they are 0
// before.
extern double wall_reference;
extern double monotonic_reference;

}  // namespace nrx
