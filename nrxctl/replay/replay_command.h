// The replay command family.
#pragma once

#include <span>
#include <string_view>

namespace nrx {

// Carries out a subcommand. Its further words are those of the command line from index on, the
// option parser's, which goes up with each word that is taken. A subcommand that is none of the
// known words is answered with the usage.
//
// Prints on standard output; every failure is a message there or a failure report, and there is no
// result. A word that is no number where one must stand ends the process with status 1, as does
// such a value in a sample file.
void replay_command(std::string_view subcommand, std::span<char* const> words, int& index);

// Prints the usage of the family on standard output.
void print_replay_usage();

}  // namespace nrx
