// The monitor of the coprocessor's bus transfers.
#pragma once

#include <span>
#include <string_view>

#include "nrxctl/base/arguments.h"

namespace nrx {

// Configures the coprocessor's half of the profiler as the arguments from index on say, prints the
// bus transfers and their data for a duration ("auto" or milliseconds), then stops the profiling of
// transfers. The profiler is enabled for that time, unless a client is connected already. All
// arguments are read, unless the coprocessor has no profiler or the driver's status cannot be read.
//
// Every failure is reported; there is no result. An invalid number ends the process with status 1.
// While the monitor runs, an interrupt asks the driver to end the stream of events. Set tick_period
// first: without it a duration never expires.
void scm_monitor(std::string_view duration, std::span<char* const> arguments, int& index);

// Reads the same arguments with the same messages, but does nothing else.
arguments_check check_scm_monitor(std::string_view duration, std::span<char* const> arguments,
                                  int& index);

}  // namespace nrx
