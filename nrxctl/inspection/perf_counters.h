// Reports 0x26 and 0x31 of a sensor: the performance counters of the always-on processor.
#pragma once

#include <string_view>

namespace nrx {

// Reads and prints the performance counters in one line, those that came back whole; says instead
// if the performance monitor is not supported or not in automatic mode. Counters that cannot be
// read are a failed check, without a line.
void print_perf_counters(std::string_view service_name);

}  // namespace nrx
