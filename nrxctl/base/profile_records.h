// The records that the coprocessor's profiler keeps in its own log.
#pragma once

#include "nrxctl/base/profile_record.h"
#include "platform/bytes.h"

namespace nrx {

// Hands every whole record in a buffer to print, in order. A trailing part is ignored.
void print_whole_records(platform::byte_view records, record_printer print);

// Drains the log of the service "profile" (report 0xd1), handing each record to print: up to ten
// reads, until one brings nothing or fails. A failure is reported twice, by the read and here.
void read_profile_records(record_printer print);

}  // namespace nrx
