// Updates of the firmware's aggregate statistics as text.
#pragma once

#include "platform/bytes.h"

namespace nrx {

// Prints a line on standard output for each complete record of a statistics update: the operation,
// the counter and the value. Trailing bytes are ignored. A record has 7 bytes, little-endian:
//    1  u8   operation      2  u8   key index      3  s32  value
// The operation determines whether the value is an integer or in q16.16 format. The number format
// is the one that the printers in hid_events.h have set.
void stats_callback(platform::byte_view records);

}  // namespace nrx
