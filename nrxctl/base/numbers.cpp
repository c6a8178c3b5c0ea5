#include "nrxctl/base/numbers.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <string>
#include <system_error>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/explanation.h"

namespace nrx {

namespace {

explanation out_of_range(std::string_view argument, std::uint32_t max) {
    return {quoted(argument) + " is out of range",
            "expected a number from 0 to " + std::to_string(max)};
}

}  // namespace

bool all_digits(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; });
}

std::optional<std::int64_t> read_digits(std::string_view digits, int base) {
    if (digits.starts_with('-')) return std::nullopt;  // from_chars accepts a minus sign
    std::int64_t value = 0;
    const char* const end = digits.data() + digits.size();
    const auto result = std::from_chars(digits.data(), end, value, base);
    if (result.ec != std::errc() || result.ptr != end) return std::nullopt;
    return value;
}

std::optional<std::int64_t> read_number(std::string_view argument) {
    const number_parts parts = split_number(argument);
    const auto magnitude = read_digits(parts.digits, parts.hexadecimal ? 16 : 10);
    if (!magnitude) return std::nullopt;
    return parts.negative ? -*magnitude : *magnitude;
}

std::optional<std::uint32_t> read_number_up_to(std::uint32_t max, std::string_view argument) {
    const auto number = read_number(argument);
    if (!number || *number < 0 || *number > max) return std::nullopt;
    return static_cast<std::uint32_t>(*number);
}

void reject_number(std::string_view argument, std::string_view message) {
    explain([&] {
        return explanation{quoted(argument) + " is not a number",
                           "expected decimal digits, or 0x and hexadecimal ones"};
    });
    reject_argument(message, argument);
}

std::int64_t parse_number(std::string_view argument, std::string_view message) {
    const auto number = read_number(argument);
    if (!number) reject_number(argument, message);
    return *number;
}

bool check_32_bit_number(std::string_view argument) {
    constexpr auto max = std::numeric_limits<std::uint32_t>::max();
    if (read_number_up_to(max, argument)) return true;
    explain([&] { return out_of_range(argument, max); });
    return false;
}

std::uint32_t parse_number_up_to(std::uint32_t max, std::string_view argument,
                                 std::string_view message) {
    const std::int64_t number = parse_number(argument, message);
    if (number >= 0 && number <= max) return static_cast<std::uint32_t>(number);
    explain([&] { return out_of_range(argument, max); });
    reject_argument(message, argument);
}

}  // namespace nrx
