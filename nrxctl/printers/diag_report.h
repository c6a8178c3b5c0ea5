// Reports 0xd0 to 0xf7, the diagnostic family.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints a report in the layout of the service that it came from: the scan state of "morvane" (any
// report), the data log of "mux" and the link counters of "baseband" (report 0xd0 only). Everything
// else is dumped. An empty report prints nothing; fields beyond a short report print as 0, with a
// failure report.
void print_diag_report(std::string_view service_name, std::int32_t report_id,
                       platform::byte_view report);

}  // namespace nrx
