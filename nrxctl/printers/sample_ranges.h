// Report 0x53 of the motion sensors: the range of the samples so far.
#pragma once

#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"

namespace nrx {

// Prints the number of samples and the lowest and highest value of each axis, for the services
// "accel", "gyro" and "compass"; the report of any other service is dumped. Values beyond a report
// shorter than 28 bytes print as 0, with a failure report.
void print_sample_ranges(std::string_view service_name, report_id id, platform::byte_view report);

}  // namespace nrx
