// A small host with everything that the collection reads.
#pragma once

#include <string>

#include "platform/virtual/machine.h"
#include "tests/support/device_test.h"

namespace tests {

struct button_host {
    interface_driver* button;
    interface_driver* arc;
    interface_driver* btmspk;
    platform::simulated::hid_unit* hid;
};

// Puts the three services and the button's HID device on a host: one byte in each report but 0xd7
// (two bytes) and the feature report 0xb4 (none).
button_host put_button_services(machine& host);

// What the collection prints on that host, and its steps.
std::string whole_text();
std::string stats_text();
std::string diagnostics_text();
std::string assets_text();
std::string features_text();

}  // namespace tests
