#include "nrxctl/base/numbers.h"

#include <algorithm>
#include <charconv>
#include <system_error>

#include "nrxctl/base/refuse_word.h"

namespace nrx {

namespace {

bool is_digit(char c) {
    return c >= '0' && c <= '9';
}

}  // namespace

bool all_digits(std::string_view text) {
    return std::all_of(text.begin(), text.end(), is_digit);
}

std::optional<std::int64_t> read_digits(std::string_view digits, int base) {
    if (digits.starts_with('-')) return std::nullopt;
    std::int64_t value = 0;
    const char* end = digits.data() + digits.size();
    const auto read = std::from_chars(digits.data(), end, value, base);
    if (read.ec != std::errc() || read.ptr != end) return std::nullopt;
    return value;
}

std::int64_t parse_number(std::string_view word, std::string_view message) {
    std::string_view digits = word;
    const bool negative = digits.starts_with('-');
    if (negative || digits.starts_with('+')) digits.remove_prefix(1);
    const bool hexadecimal = digits.starts_with(hex_prefix);
    if (hexadecimal) digits.remove_prefix(hex_prefix.size());
    const auto value = read_digits(digits, hexadecimal ? 16 : 10);
    if (!value) refuse_word(message, word);
    return negative ? -*value : *value;
}

std::uint32_t parse_number_up_to(std::uint32_t largest, std::string_view word,
                                 std::string_view message) {
    const std::int64_t number = parse_number(word, message);
    if (number < 0 || number > largest) refuse_word(message, word);
    return static_cast<std::uint32_t>(number);
}

}  // namespace nrx
