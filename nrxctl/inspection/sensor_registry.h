// What the platform's registry knows about sensors.
#pragma once

#include <string_view>

namespace nrx {

// Prints the statistics of a sensor's HID events in one line: the number of events, how many were
// enqueued and dropped, and when that happened last, in seconds.
//
// The numbers are in the dictionary "DebugState" of two entries: the third and the fourth on the
// way down from the sensor's interface service, from first child to first child. A missing count
// prints as -1, a missing time as 0. A missing entry is reported, and no line is printed.
void print_event_statistics(std::string_view service_name);

// Helps a user whose sensor is not found. Prints the registry names of all HID interface services
// in one line; a name that cannot be read ends the list. Then prints how the service name was
// looked up, with and without the prefix: the address of the matching dictionary and the handle of
// the service, 0 if there is none.
void print_hid_services(std::string_view service_name);

}  // namespace nrx
