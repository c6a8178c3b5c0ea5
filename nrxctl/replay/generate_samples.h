// The subcommand that prints a generated signal as sample lines.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "nrxctl/base/arguments.h"

namespace nrx {

struct signal_request {
    std::string_view service;
    std::string_view signal_type;
    std::uint32_t interval;  // microseconds between two samples
    std::uint32_t samples;
};

// Reads four arguments: service, signal type, interval in microseconds, and either the number of
// samples or, with the suffix "hz" or "Hz", the frequency of the signal; then one period is
// generated. Only the low 32 bits of each number count.
//
// Returns nullopt with a failure report if an argument is missing, the frequency is 0, or a period
// contains no sample. A malformed number ends the process with status 1, after a message on
// standard output.
std::optional<signal_request> read_signal_request(argument_cursor& arguments);

// Prints the requested samples, a line each, or one line that names an unknown service or a signal
// that the service does not generate. Stops at the first line that cannot be written, because there
// may be four billion of them.
void generate_samples(const signal_request& request);

namespace replay {

// The subcommand. Reads its own arguments and reports its own failures.
void generate(argument_cursor& arguments);

// Reads the same arguments with the same messages, and does nothing else. A number that is not one
// of 32 bits is a usage error, and so is a frequency whose period is not computed in 32 bits.
arguments_check check_generate(argument_cursor& arguments);

}  // namespace replay

}  // namespace nrx
