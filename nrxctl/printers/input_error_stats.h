// Report 0xe3: error statistics of the input reports.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints the counters under a heading with the service's name. An empty report prints nothing;
// counters beyond a report shorter than 64 bytes print as 0, with a failure report.
void print_input_error_stats(std::string_view service_name, std::int32_t report_id,
                             platform::byte_view report);

}  // namespace nrx
