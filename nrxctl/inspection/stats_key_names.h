// Names of the firmware's aggregate-statistics counters.
#pragma once

#include <cstdint>
#include <ostream>

namespace nrx {

// Prints the name of the counter with a key index; "?" for an index without one.
void print_stats_key_name(std::ostream& out, std::uint8_t index);

}  // namespace nrx
