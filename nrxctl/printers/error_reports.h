// The reports of errors: 0xe3, of the input reports, and 0x45, of the transfers on the buses.
#pragma once

#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"

namespace nrx {

// Prints the counters under a heading with the service's name. An empty report prints nothing;
// counters beyond a report shorter than 64 bytes print as 0, with a failure report.
void print_input_error_stats(std::string_view service_name, report_id id,
                             platform::byte_view report);

// Prints one line for each complete 32-byte record: the errors of reads, writes and other
// operations, each with the number of those operations.
void print_transfer_errors(std::string_view service_name, report_id id, platform::byte_view report);

}  // namespace nrx
