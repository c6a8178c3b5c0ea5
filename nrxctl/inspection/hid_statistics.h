// Aggregate-statistics updates of the firmware as text.
#pragma once

#include "platform/bytes.h"

namespace nrx {

// Prints a line on standard output for each whole record: what is done to which counter, and the
// value. A trailing part is ignored. A record (from a statistics update) is 7 bytes, little-endian:
//    1  u8   operation      2  u8   key index      3  s32  value
// The value is an integer or has 16 fraction bits, as the operation tells. Numbers are in the
// format that the printers of hid_events.h have left.
void stats_callback(platform::byte_view records);

}  // namespace nrx
