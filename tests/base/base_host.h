// The services that the base operations work on.
#pragma once

#include "tests/support/device_test.h"

namespace tests {

// Registers "accel" with the id 31, which has the report 0xd0 (1 2 3), the command 0x20 (answers
// 9 8), the named property "gain" (4 5 6) and a scalar method; "mca"; and the driver of the HID
// devices, which answers with its input, reversed, and a byte 0xff.
void put_base_services(machine& host);

}  // namespace tests
