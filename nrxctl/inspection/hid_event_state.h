// What the printers of HID events keep from one event to the next. Process-wide.
#pragma once

#include <ostream>

namespace nrx {

// When the first and the last event occurred, in seconds on the monotonic clock, and when the last
// vendor-defined event occurred, in seconds on the wall clock. 0 before such an event. Written by
// print_hid_event, and by tests that start over.
extern double first_event_time;
extern double last_event_time;
extern double last_wall_time;

// The stream to which HID events, reset notices and statistics updates are written. A number format
// that one of them sets applies to all that follow. The text is held until the line ends.
std::ostream& event_stream();

// Ends the line: writes it on standard output with one write, unless the watch has reached the
// limit of print_limit.h.
void end_event_line();

}  // namespace nrx
