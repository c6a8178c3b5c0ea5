// Numbers as users type them.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace nrx {

// Begins a hexadecimal number or service id.
inline constexpr std::string_view hex_prefix = "0x";

// Begins a decimal value in a payload, where hexadecimal is the default.
inline constexpr std::string_view decimal_prefix = "0d";

// Whether every character is a decimal digit; so it is for no characters at all.
bool all_digits(std::string_view text);

// The value of a run of digits in base 10 or 16, and of nothing but digits: no sign, no prefix, no
// blanks. None if there are no digits or the value is beyond signed 64 bits.
std::optional<std::int64_t> read_digits(std::string_view digits, int base);

// The value of a command-line word: an optional sign, then "0x" and hexadecimal digits, or decimal
// digits only. The digits must fit into signed 64 bits before the sign is applied. Anything else
// ends the process with status 1 after "message (word)" as a line on standard output.
std::int64_t parse_number(std::string_view word, std::string_view message);

// The low 32 bits of such a number.
inline std::uint32_t parse_low_32_bits(std::string_view word, std::string_view message) {
    return static_cast<std::uint32_t>(parse_number(word, message));
}

// The number itself, refused likewise if it is negative or beyond the largest.
std::uint32_t parse_number_up_to(std::uint32_t largest, std::string_view word,
                                 std::string_view message);

}  // namespace nrx
