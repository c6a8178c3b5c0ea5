// The process-wide state of the printers of HID events, as a test finds it.
#pragma once

#include <string>

#include "platform/hid_event.h"
#include "tests/support/hid_host.h"

namespace tests {

// A tick is a microsecond; the references are 0, no event has been printed, and the stream's format
// is that of a new one.
void forget_events();

// An event that happened at a time in seconds.
platform::hid_event event_at(double time, std::uint32_t type);
platform::hid_event vendor_event_at(double time, const std::string& data);

// What is printed of an event, with a label.
std::string printed_event(const platform::hid_event& event, const std::string& label = "");

class event_test : public device_test {
protected:
    event_test() { forget_events(); }
};

}  // namespace tests
