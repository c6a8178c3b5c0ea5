// The statistics of a sensor's HID events, from properties of the registry.
#pragma once

#include <string_view>

namespace nrx {

// Walks down from a sensor's interface service, from first child to first child, and prints one
// line: the events of the third level, and what the fourth has enqueued and dropped, with the times
// of the last ones in seconds (both from the dictionary "DebugState"). A count that is not there
// prints as -1, a time as 0; a level that is not there is a failed check, without a line.
void print_event_statistics(std::string_view service_name);

}  // namespace nrx
