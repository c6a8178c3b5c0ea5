// The numbers of sample lines.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/numbers.h"

namespace nrx {

// The low 32 bits of a number. A text that is none ends the process with status 1, after a message
// with the text on standard output.
inline std::uint32_t parse_sample(std::string_view text) {
    return parse_low_32_bits(text, "error converting samples");
}

// A time stamp: the low 32 bits of a number, widened with their sign. Ends the process likewise.
inline std::uint64_t parse_timestamp(std::string_view text) {
    const auto low = static_cast<std::int32_t>(parse_number(text, "error converting timestamp"));
    return static_cast<std::uint64_t>(std::int64_t{low});
}

// A temperature in hundredths of a degree as degrees with 16 fraction bits, towards zero, both
// signed. What does not fit into 32 bits on the way is cut off.
constexpr std::uint32_t fixed_point_degrees(std::uint32_t hundredths) {
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(hundredths << 16) / 100);
}

}  // namespace nrx
