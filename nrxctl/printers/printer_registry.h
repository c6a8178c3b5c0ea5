// Which printer prints a report.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// The printer registered for a report identifier; null for an identifier that has none.
report_printer find_report_printer(std::int32_t report_id);

// Prints a report with the printer registered for its identifier, or as a dump if there is none.
void print_report(std::string_view service_name, std::int32_t report_id,
                  platform::byte_view report);

}  // namespace nrx
