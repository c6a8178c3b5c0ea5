// What the printer of HID events keeps from event to event. Process-wide; nobody else writes it,
// but a test that begins anew.
#pragma once

namespace nrx {

// When the first event and the last one happened, in seconds of the monotonic clock, and when the
// last vendor-defined one happened, in seconds of the wall clock. 0 until then.
extern double first_event_time;
extern double last_event_time;
extern double last_wall_time;

}  // namespace nrx
