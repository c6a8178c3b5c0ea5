#include "nrxctl/base/numbers.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <system_error>

#include "nrxctl/base/refuse_word.h"

namespace nrx {

namespace {

bool is_digit(char c) {
    return c >= '0' && c <= '9';
}

constexpr std::uint8_t no_digit = 0xff;

// What each character is worth as a digit, in bases up to 16.
constexpr auto digit_values = [] {
    std::array<std::uint8_t, 256> values{};
    values.fill(no_digit);
    for (std::uint8_t i = 0; i < 10; ++i)
        values['0' + i] = i;
    for (std::uint8_t i = 10; i < 16; ++i)
        values['a' + i - 10] = values['A' + i - 10] = i;
    return values;
}();

// So many digits fit into signed 64 bits in any base up to 16.
constexpr std::size_t short_length = 15;

// Short numbers are read by the million, in sample files.
template <unsigned Base>
std::optional<std::int64_t> read_short(std::string_view digits) {
    std::uint64_t value = 0;
    bool all_fit = true;
    for (const char c : digits) {
        const std::uint8_t digit = digit_values[static_cast<std::uint8_t>(c)];
        all_fit &= digit < Base;
        value = value * Base + digit;
    }
    if (!all_fit) return std::nullopt;
    return static_cast<std::int64_t>(value);
}

}  // namespace

bool all_digits(std::string_view text) {
    return std::all_of(text.begin(), text.end(), is_digit);
}

std::optional<std::int64_t> read_digits(std::string_view digits, int base) {
    if (digits.empty() || digits.front() == '-') return std::nullopt;
    if (digits.size() <= short_length)
        return base == 16 ? read_short<16>(digits) : read_short<10>(digits);
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
