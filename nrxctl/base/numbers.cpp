#include "nrxctl/base/numbers.h"

#include <algorithm>
#include <charconv>
#include <system_error>

#include "nrxctl/base/arguments.h"

namespace nrx {

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

std::int64_t parse_number(std::string_view argument, std::string_view message) {
    const number_parts parts = split_number(argument);
    const auto magnitude = read_digits(parts.digits, parts.hexadecimal ? 16 : 10);
    if (!magnitude) reject_argument(message, argument);
    return parts.negative ? -*magnitude : *magnitude;
}

std::uint32_t parse_number_up_to(std::uint32_t max, std::string_view argument,
                                 std::string_view message) {
    const std::int64_t number = parse_number(argument, message);
    if (number < 0 || number > max) reject_argument(message, argument);
    return static_cast<std::uint32_t>(number);
}

}  // namespace nrx
