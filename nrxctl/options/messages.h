// What nrxctl itself says.
#pragma once

#include <string>
#include <string_view>

#include "nrxctl/nrxtoollib.h"
#include "platform/bytes.h"

namespace nrx::nrxctl {

// Returns "host: DESCRIPTION".
std::string host_line();

// The rest goes to standard error.

// Writes "nrxctl: TEXT" as a line.
void print_message(std::string_view text);

// Writes the explanations so far as messages.
void print_explanations(explanation_list& explanations);

// For people alone, if standard error is a terminal:

// Says which host answers.
void announce_host();

// Shows what is about to be written to a device: a message, and the bytes as a dump.
void echo_payload(std::string_view target, platform::byte_view payload);

}  // namespace nrx::nrxctl
