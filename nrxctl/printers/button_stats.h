// Report 0xd7 of the button service: statistics of the last press.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints the statistics as a table, times in microseconds. An empty report prints nothing; fields
// beyond a report shorter than 282 bytes print as 0, with a failure report.
void print_button_stats(std::string_view service_name, std::int32_t report_id,
                        platform::byte_view report);

}  // namespace nrx
