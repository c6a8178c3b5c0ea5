// Reports 0xd0 to 0xf7, the diagnostic family.
#pragma once

#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"

namespace nrx {

// Prints a report in the layout of its service:
//   "morvane", any report    the scan state, 40 bytes; the time to the next scan is in seconds
//   "mux", report 0xd0       the data log; a line for each complete 12-byte record
//   "baseband", report 0xd0  the link counters, 64 bytes
// Any other report is dumped. An empty report prints nothing; fields beyond a scan state or link
// counters that are too short print as 0, with a failure report.
void print_diag_report(std::string_view service_name, report_id id, platform::byte_view report);

}  // namespace nrx
