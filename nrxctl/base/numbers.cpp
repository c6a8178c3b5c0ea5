#include "nrxctl/base/numbers.h"

#include <algorithm>
#include <charconv>
#include <system_error>

#include "nrxctl/base/eight_bytes.h"
#include "nrxctl/base/refuse_word.h"

namespace nrx {

namespace {

bool is_digit(char c) {
    return c >= '0' && c <= '9';
}

// Numbers are read by the million, in sample files: up to eight digits at once, as the bytes of a
// number.
constexpr std::size_t word_length = 8;

// Up to eight characters, but at least one, with zeros in front of them that make them eight. Reads
// nothing beyond the text.
std::uint64_t load_padded(std::string_view text) {
    const std::size_t length = text.size();
    if (length == word_length) return load_bytes<std::uint64_t>(text.data());
    const std::size_t shift = 8 * (word_length - length);
    const std::uint64_t padding = eight_times('0') >> (8 * length);
    // Two halves, or three characters, that lie on each other in part.
    if (length >= 4) {
        const auto front = load_bytes<std::uint32_t>(text.data());
        const auto back = load_bytes<std::uint32_t>(text.data() + length - 4);
        return padding | front << shift | back << 32;
    }
    const auto front = load_bytes<std::uint8_t>(text.data());
    const auto middle = load_bytes<std::uint8_t>(text.data() + length / 2);
    const auto back = load_bytes<std::uint8_t>(text.data() + length - 1);
    return padding | front << shift | middle << (shift + 8 * (length / 2)) | back << 56;
}

struct digit_bytes {
    std::uint64_t values;
    bool all_fit;  // every character is a digit
};

template <std::uint64_t Base>
digit_bytes digits_of(std::uint64_t characters);

template <>
digit_bytes digits_of<10>(std::uint64_t characters) {
    const std::uint64_t values = characters ^ eight_times('0');
    return {values, (((values + eight_times(0x80 - 10)) | values) & high_bits) == 0};
}

// A byte with the bit that letters have alone is to become a digit from 10 on, any other one below
// 10; a subtraction that borrows leaves high bits where it began.
template <>
digit_bytes digits_of<16>(std::uint64_t characters) {
    constexpr unsigned lower_case_bit = 5;
    const std::uint64_t letters = (characters >> 6) & eight_times(1);
    const std::uint64_t upper_case = characters & ~(letters << lower_case_bit);
    const std::uint64_t values = upper_case - eight_times('0') - letters * ('A' - '9' - 1);
    const std::uint64_t wrong = (values + eight_times(0x80 - 10)) ^ (letters << 7);
    return {values, ((wrong & high_bits) | (values & eight_times(0xf0))) == 0};
}

// Joins neighbours, two and two, until one number is left.
template <std::uint64_t Base>
std::uint64_t join_digits(std::uint64_t values) {
    values = (values * Base + (values >> 8)) & 0x00ff00ff00ff00ff;
    values = (values * (Base * Base) + (values >> 16)) & 0x0000ffff0000ffff;
    return (values * (Base * Base * Base * Base) + (values >> 32)) & 0xffffffff;
}

// Stands for what is no run of digits, which have no sign. An optional would go through memory.
constexpr std::int64_t no_number = -1;

// One to eight digits. In line, as a call's saving of registers would take a good part of the time.
template <std::uint64_t Base>
[[gnu::always_inline]] inline std::int64_t read_word(std::string_view digits) {
    const auto [values, all_fit] = digits_of<Base>(load_padded(digits));
    return all_fit ? static_cast<std::int64_t>(join_digits<Base>(values)) : no_number;
}

// Nine to fifteen digits, which fit into signed 64 bits in either base.
template <std::uint64_t Base>
std::int64_t read_two_words(std::string_view digits) {
    constexpr std::int64_t word_base = Base * Base * Base * Base * Base * Base * Base * Base;
    const std::size_t high_length = digits.size() - word_length;
    const std::int64_t high = read_word<Base>(digits.substr(0, high_length));
    const std::int64_t low = read_word<Base>(digits.substr(high_length));
    return high == no_number || low == no_number ? no_number : high * word_base + low;
}

// read_digits, or no_number.
template <std::uint64_t Base>
std::int64_t read_run(std::string_view digits) {
    if (digits.empty()) return no_number;
    if (digits.size() <= word_length) return read_word<Base>(digits);
    if (digits.size() < 2 * word_length) return read_two_words<Base>(digits);
    if (digits.front() == '-') return no_number;
    std::int64_t value = 0;
    const char* end = digits.data() + digits.size();
    const auto read = std::from_chars(digits.data(), end, value, Base);
    return read.ec == std::errc() && read.ptr == end ? value : no_number;
}

struct number_parts {
    bool negative;
    bool hexadecimal;
    std::string_view digits;
};

inline number_parts split_number(std::string_view word) {
    const bool negative = word.starts_with('-');
    if (negative || word.starts_with('+')) word.remove_prefix(1);
    const bool hexadecimal = word.starts_with(hex_prefix);
    if (hexadecimal) word.remove_prefix(hex_prefix.size());
    return {negative, hexadecimal, word};
}

// parse_number for any word; apart from it, for the registers that the calls here want saved.
[[gnu::noinline]] std::int64_t parse_any_number(std::string_view word, std::string_view message) {
    const auto [negative, hexadecimal, digits] = split_number(word);
    const std::int64_t value = hexadecimal ? read_run<16>(digits) : read_run<10>(digits);
    if (value == no_number) refuse_word(message, word);
    return negative ? -value : value;
}

}  // namespace

bool all_digits(std::string_view text) {
    return std::all_of(text.begin(), text.end(), is_digit);
}

std::optional<std::int64_t> read_digits(std::string_view digits, int base) {
    const std::int64_t value = base == 16 ? read_run<16>(digits) : read_run<10>(digits);
    return value == no_number ? std::nullopt : std::optional(value);
}

std::int64_t parse_number(std::string_view word, std::string_view message) {
    // Most values in sample files are "0x" and eight digits: such a word is read without a look at
    // what else it might be.
    if (word.size() == hex_prefix.size() + word_length && word.starts_with(hex_prefix)) {
        const std::int64_t value = read_word<16>({word.data() + hex_prefix.size(), word_length});
        if (value != no_number) return value;
    }
    const auto [negative, hexadecimal, digits] = split_number(word);
    if (!digits.empty() && digits.size() <= word_length) {
        const std::int64_t value = hexadecimal ? read_word<16>(digits) : read_word<10>(digits);
        if (value != no_number) return negative ? -value : value;
    }
    return parse_any_number(word, message);
}

std::uint32_t parse_number_up_to(std::uint32_t largest, std::string_view word,
                                 std::string_view message) {
    const std::int64_t number = parse_number(word, message);
    if (number < 0 || number > largest) refuse_word(message, word);
    return static_cast<std::uint32_t>(number);
}

}  // namespace nrx
