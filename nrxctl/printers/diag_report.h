// Reports 0xd0 to 0xf7, the diagnostic family.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints a report in the layout of the service that it came from: the scan state of "morvane" (any
// report; the time to the next scan in seconds), the data log of "mux" (report 0xd0; a line for
// each whole 12-byte record) and the link counters of "baseband" (report 0xd0). Everything else is
// dumped. An empty report prints nothing; fields beyond a scan state shorter than 40 bytes, or link
// counters shorter than 64, print as 0, with a failure report.
void print_diag_report(std::string_view service_name, std::int32_t report_id,
                       platform::byte_view report);

}  // namespace nrx
