// Report 0x45: transfer errors of the buses.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints one line for each whole 32-byte record: the errors of reads, writes and other operations,
// each over the number of those operations. A report shorter than a record prints nothing.
void print_transfer_errors(std::string_view service_name, std::int32_t report_id,
                           platform::byte_view report);

}  // namespace nrx
