// Printers of reports, by report identifier.
#pragma once

#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"

namespace nrx {

// Prints one report of a service on standard output. A reply without bytes is an empty view.
using report_printer = void (*)(std::string_view service_name, report_id id,
                                platform::byte_view report);

// Returns the printer registered for a report identifier, or null if there is none.
report_printer find_report_printer(report_id id);

// Prints a report with the printer registered for its identifier, or as a dump if there is none.
void print_report(std::string_view service_name, report_id id, platform::byte_view report);

// The same for a service known by its registry name without prefix, some of which have reports of
// their own: those of the button.
void print_service_report(std::string_view service_name, report_id id, platform::byte_view report);

}  // namespace nrx
