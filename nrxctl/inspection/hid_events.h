// HID events and resets of the event system as text, a line each on standard output.
//
// The printers share a stream with stats_callback, whose format an accelerometer and a
// vendor-defined event switch for good: to fixed notation with six digits, and left alignment.
#pragma once

#include <string_view>

#include "platform/hid_event.h"
#include "platform/hid_event_client.h"

namespace nrx {

// Prints an event: its time since the first and since the previous one and its latency, all in
// seconds; the fields of an accelerometer event. Of a vendor-defined event the line has the present
// time, the event's time on both clocks, its data as text up to the first NUL, the label, and a
// marker unless it came about half a second after the previous one.
void print_hid_event(const platform::hid_event& event, std::string_view label);

// Prints that the event system was reset, with the client, the context and the client's list of
// services as pointers.
void reset_callback(const platform::hid_event_client& client, const void* context);

}  // namespace nrx
