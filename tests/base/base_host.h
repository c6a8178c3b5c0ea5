// A host with the services that base operations need.
#pragma once

#include "tests/support/device_test.h"

namespace tests {

// Adds "accel" with the id 31, the report 0xd0 (1 2 3), the command 0x20 (replies 9 8), the named
// property "gain" (4 5 6) and a scalar method; "mca"; and the driver of the HID devices, which
// replies with its input, reversed, and a byte 0xff.
void add_base_services(machine& host);

}  // namespace tests
