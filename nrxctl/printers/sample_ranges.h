// Report 0x53 of the motion sensors: the range of the samples seen.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// Prints the number of samples and the lowest and highest value of each axis, for the services
// "accel", "gyro" and "compass"; the report of any other service is dumped. Values beyond a report
// shorter than 28 bytes print as 0, with a failure report.
void print_sample_ranges(std::string_view service_name, std::int32_t report_id,
                         platform::byte_view report);

}  // namespace nrx
