// Bytes of event records in hexadecimal, a line at a time.
#pragma once

#include <string_view>

#include "nrxctl/base/profile_record.h"
#include "platform/bytes.h"

namespace nrx {

// Writes a line on standard output: the label, then each byte as two lower-case hexadecimal digits,
// with a blank behind it if spaced is 1 (no other value). The label's length + 3 * the number of
// bytes + 1 must be less than 256; otherwise the process stops, with a report on standard error.
void nrx_profile_hexdump(std::string_view label, platform::byte_view bytes, int spaced);

// Prints a record as "prof-event " and its 48 bytes. A record_printer.
void dump_profile_record(const profile_record& record);

}  // namespace nrx
