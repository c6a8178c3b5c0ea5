// HID events and resets of the event system as text, one line each on standard output.
//
// Accelerometer and vendor-defined events set the number format for all that is printed after them,
// updates that stats_callback prints included: fixed notation, six digits, left-aligned.
#pragma once

#include <string_view>

#include "platform/hid_event.h"
#include "platform/hid_event_client.h"

namespace nrx {

// Prints an event. Times are in seconds.
//
// Null and accelerometer events: the time since the first and since the previous event, the
// latency, and the fields of the acceleration. Vendor-defined events: the current time, the time of
// the event on both clocks, its data as text up to the first NUL, the label, and a marker unless
// the previous one occurred about half a second before. Other events: the type and the latency.
void print_hid_event(const platform::hid_event& event, std::string_view label);

// Prints that the event system was reset, with the client, the context and the client's list of
// services as pointers.
void reset_callback(const platform::hid_event_client& client, const void* context);

}  // namespace nrx
