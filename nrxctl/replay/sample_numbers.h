// The numbers of sample lines.
#pragma once

#include <cstdint>
#include <string_view>

namespace nrx {

// The low 32 bits of a number. A text that is none ends the process with status 1, after a message
// with the text on standard output.
std::uint32_t parse_sample(std::string_view text);

// A time stamp: the low 32 bits of a number, widened with their sign. Ends the process likewise.
std::uint64_t parse_timestamp(std::string_view text);

// A temperature in hundredths of a degree as degrees with 16 fraction bits, towards zero, both
// signed. What does not fit into 32 bits on the way is cut off.
std::uint32_t fixed_point_degrees(std::uint32_t hundredths);

}  // namespace nrx
