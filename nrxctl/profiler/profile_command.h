// The profiler command family.
#pragma once

#include <span>
#include <string_view>

namespace nrx {

// Carries out a subcommand. Its further words are those of the command line from index on, the
// option parser's, which goes up with each word that is taken. A subcommand that is none of the
// known words begins a profiling run, and is its first word.
//
// Prints on standard output; every failure is a failure report, and there is no result. A word that
// is no number where one must stand ends the process with status 1. While the command runs, an
// interrupt asks the driver to end the stream of events. Set tick_period first: without it a
// duration is never over.
void profile_command(std::string_view subcommand, std::span<char* const> words, int& index);

}  // namespace nrx
