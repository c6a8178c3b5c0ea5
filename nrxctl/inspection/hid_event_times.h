// What the printer of HID events measures by. All are process-wide, in seconds; tick_period.h has
// the tick of the monotonic clock, which a front end sets as well.
#pragma once

namespace nrx {

// One instant on the wall clock, as seconds since 1970, and on the monotonic clock, as ticks times
// the tick period. A front end sets both from one reading before it prints events; they are 0
// before.
extern double wall_reference;
extern double monotonic_reference;

// What the printer keeps from event to event: when the first one and the last one happened, on the
// monotonic clock, and when the last vendor-defined one happened, on the wall clock. 0 until then.
extern double first_event_time;
extern double last_event_time;
extern double last_wall_time;

}  // namespace nrx
