// Report 0xd8 of the button service: the haptic asset table.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints the report's length beside the expected one, then one line per speed and button event;
// gains are fractions. An empty report prints nothing. Entries beyond a short report print as
// zeros; bytes beyond the table are not read: the length line is the only sign of either.
void print_haptic_assets(std::string_view service_name, std::int32_t report_id,
                         platform::byte_view report);

}  // namespace nrx
