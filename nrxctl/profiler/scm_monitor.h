// The monitor of the coprocessor's bus transfers.
#pragma once

#include <span>
#include <string_view>

namespace nrx {

// Configures the coprocessor's half of the profiler as the words of the command line from index on
// say (taking all of them, if the coprocessor has one), prints the bus transfers and their data for
// the duration ("auto" or milliseconds), and stops the profiling of transfers. The profiler is
// enabled for that long, unless a client is connected already.
//
// Every failure is a failure report, and there is no result. A duration that is no number, or a
// number in a word that is none, ends the process with status 1. An interrupt asks the driver to
// end the stream of events. Set tick_period first: without it a duration is never over.
void scm_monitor(std::string_view duration, std::span<char* const> words, int& index);

}  // namespace nrx
