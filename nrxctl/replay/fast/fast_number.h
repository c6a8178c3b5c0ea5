// Numbers of sample lines, read up to eight digits at a time.
#pragma once

#include <cstdint>
#include <limits>
#include <string_view>

#include "nrxctl/base/numbers.h"

namespace nrx {

// Returned for a text that only parse_number can read. No number of up to fifteen digits has this
// value.
inline constexpr std::int64_t not_parsed = std::numeric_limits<std::int64_t>::min();

// Returns the value of a number with one to fifteen digits, not_parsed for any other text. Reads
// nothing outside the text.
std::int64_t read_fast_number(std::string_view text);

// Does the same as parse_number.
inline std::int64_t parse_fast_number(std::string_view text, std::string_view message) {
    const std::int64_t value = read_fast_number(text);
    return value == not_parsed ? parse_number(text, message) : value;
}

}  // namespace nrx
