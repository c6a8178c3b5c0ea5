// The reports of the button service: 0xd7, statistics of the last press, and 0xd8, the haptic asset
// table.
#pragma once

#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"

namespace nrx {

// Prints the statistics as a table, times in microseconds. An empty report prints nothing; fields
// beyond a report shorter than 282 bytes print as 0, with a failure report.
void print_button_stats(std::string_view service_name, report_id id, platform::byte_view report);

// Prints the report's length and the expected one, then one line per speed and button event; gains
// are fractions. An empty report prints nothing. The length line is the only sign of another
// length: entries beyond a short report print as zeros, and bytes after the table are ignored.
void print_haptic_assets(std::string_view service_name, report_id id, platform::byte_view report);

}  // namespace nrx
