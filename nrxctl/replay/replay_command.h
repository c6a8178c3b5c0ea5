// The replay command family.
#pragma once

#include <span>
#include <string_view>

#include "nrxctl/base/arguments.h"

namespace nrx {

// Runs a subcommand. Its arguments are those of the command line from index on, the option parser's
// index, which advances with each argument read. An unknown subcommand prints the usage.
//
// Prints on standard output. Every failure is a message there or a failure report; there is no
// result. A malformed number ends the process with status 1, on the command line and in a sample
// file.
void replay_command(std::string_view subcommand, std::span<char* const> arguments, int& index);

// The subcommands.
std::span<const subcommand_row> replay_subcommands();

// Reads the arguments as replay_command does, with the same messages, but does nothing else: no
// call of the platform, and no sample file is opened. More arguments than the subcommand takes, and
// numbers of which it would drop bits, are a usage error.
arguments_check check_replay_command(std::string_view subcommand, std::span<char* const> arguments,
                                     int& index);

// Prints the usage of the family on standard output.
void print_replay_usage();

}  // namespace nrx
