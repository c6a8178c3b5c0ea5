// What the words behind "generate" ask for.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "nrxctl/base/argument_words.h"

namespace nrx {

struct signal_request {
    std::string_view service;
    std::string_view signal_type;
    std::uint32_t interval;  // microseconds between two samples
    std::uint32_t samples;
};

// Takes four words: service, signal type, interval in microseconds, and either a number of samples
// or the signal's frequency, with "hz" or "Hz" behind it, of which there are then as many samples
// as make one period. Numbers count modulo 2^32.
//
// None, with a failure report, if a word is missing, or the frequency is 0 or has no sample in a
// period. A word that is no number ends the process with status 1, after a message on standard
// output.
std::optional<signal_request> read_signal_request(argument_words& words);

// Writes the samples that are asked for on standard output, a line each; or a line that says that
// there is no such service, or no such signal for it. Ends with the first line that cannot be
// written: there may be four billion of them.
void generate_samples(const signal_request& request);

}  // namespace nrx
