// The profiler command family.
#pragma once

#include <span>
#include <string_view>

#include "nrxctl/base/arguments.h"

namespace nrx {

// Runs a subcommand. Its arguments are those of the command line from index on, the option parser's
// index, which advances with each argument read. An unknown subcommand starts a profiling run, of
// which it is the first argument.
//
// Prints on standard output. Every failure is reported; there is no result. An invalid number ends
// the process with status 1. While the command runs, an interrupt asks the driver to end the stream
// of events. Set tick_period first: without it a duration never expires.
void profile_command(std::string_view subcommand, std::span<char* const> arguments, int& index);

// The subcommands.
std::span<const subcommand_row> profile_subcommands();

// Reads the arguments as profile_command does, with the same messages, but does nothing else. More
// arguments than the subcommand takes are a usage error.
arguments_check check_profile_command(std::string_view subcommand, std::span<char* const> arguments,
                                      int& index);

// Returns true if the subcommand prints records as they arrive: "monitor" and a profiling run,
// which is anything that is no subcommand.
bool is_profile_watch(std::string_view subcommand);

}  // namespace nrx
