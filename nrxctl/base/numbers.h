// Numbers as users type them.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace nrx {

// The prefix of a hexadecimal number or service id.
inline constexpr std::string_view hex_prefix = "0x";

// The prefix of a decimal value in a payload, where hexadecimal is the default.
inline constexpr std::string_view decimal_prefix = "0d";

// Returns true if every character is a decimal digit, or if the text is empty.
bool all_digits(std::string_view text);

// Returns the value of a run of digits in base 10 or 16, without sign, prefix or spaces. Returns
// nullopt if the run is empty, has any other character, or its value exceeds signed 64 bits.
std::optional<std::int64_t> read_digits(std::string_view digits, int base);

// A number as a user types it, taken apart.
struct number_parts {
    bool negative;
    bool hexadecimal;
    std::string_view digits;  // not checked
};

// Removes an optional sign and then an optional "0x".
constexpr number_parts split_number(std::string_view argument) {
    const bool negative = argument.starts_with('-');
    if (negative || argument.starts_with('+')) argument.remove_prefix(1);
    const bool hexadecimal = argument.starts_with(hex_prefix);
    if (hexadecimal) argument.remove_prefix(hex_prefix.size());
    return {negative, hexadecimal, argument};
}

// Returns the value of an argument, or nullopt if parse_number would reject it.
std::optional<std::int64_t> read_number(std::string_view argument);

// Returns a number from 0 to max, or nullopt if the argument is none.
std::optional<std::uint32_t> read_number_up_to(std::uint32_t max, std::string_view argument);

// Returns the value of an argument: an optional sign, then "0x" and hexadecimal digits, or decimal
// digits. The digits must fit signed 64 bits before the sign is applied. Anything else ends the
// process with status 1 after "message (argument)" as a line on standard output.
std::int64_t parse_number(std::string_view argument, std::string_view message);

// Rejects an argument that is not a number, as parse_number does.
[[noreturn]] void reject_number(std::string_view argument, std::string_view message);

// Returns the low 32 bits of the value of parse_number.
inline std::uint32_t parse_low_32_bits(std::string_view argument, std::string_view message) {
    return static_cast<std::uint32_t>(parse_number(argument, message));
}

// Returns true if an argument is a number from 0 to 4294967295; otherwise explains that it is out
// of range. For an argument of which only the low 32 bits count.
bool check_32_bit_number(std::string_view argument);

// Returns a number from 0 to max. Rejects any other argument as parse_number does.
std::uint32_t parse_number_up_to(std::uint32_t max, std::string_view argument,
                                 std::string_view message);

}  // namespace nrx
