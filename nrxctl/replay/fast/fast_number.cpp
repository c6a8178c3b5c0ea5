#include "nrxctl/replay/fast/fast_number.h"

#include <cstddef>

#include "nrxctl/replay/fast/swar.h"

namespace nrx {

namespace {

using swar::broadcast;

constexpr std::size_t word_length = 8;

// Returns a text of one to eight characters, padded with '0' in front to eight. Each character is
// loaded at least once; loads of a shorter text overlap.
std::uint64_t load_padded(std::string_view text) {
    const std::size_t length = text.size();
    if (length == word_length) return swar::load<std::uint64_t>(text.data());
    const std::size_t shift = 8 * (word_length - length);
    const std::uint64_t padding = broadcast('0') >> (8 * length);
    if (length >= 4) {
        const auto front = swar::load<std::uint32_t>(text.data());
        const auto back = swar::load<std::uint32_t>(text.data() + length - 4);
        return padding | front << shift | back << 32;
    }
    const auto front = swar::load<std::uint8_t>(text.data());
    const auto middle = swar::load<std::uint8_t>(text.data() + length / 2);
    const auto back = swar::load<std::uint8_t>(text.data() + length - 1);
    return padding | front << shift | middle << (shift + 8 * (length / 2)) | back << 56;
}

struct digit_bytes {
    std::uint64_t values;
    bool valid;  // every character is a digit
};

template <std::uint64_t Base>
digit_bytes decode_digits(std::uint64_t characters);

template <>
digit_bytes decode_digits<10>(std::uint64_t characters) {
    const std::uint64_t values = characters ^ broadcast('0');
    return {values, (((values + broadcast(0x80 - 10)) | values) & swar::high_bits) == 0};
}

// Bit 6 tells letters from decimal digits. A letter must decode to 10 or more, any other character
// to less than 10. A subtraction that borrows sets high bits from where it began.
template <>
digit_bytes decode_digits<16>(std::uint64_t characters) {
    constexpr unsigned lower_case_bit = 5;
    const std::uint64_t letters = (characters >> 6) & broadcast(1);
    const std::uint64_t upper_case = characters & ~(letters << lower_case_bit);
    const std::uint64_t values = upper_case - broadcast('0') - letters * ('A' - '9' - 1);
    const std::uint64_t invalid = (values + broadcast(0x80 - 10)) ^ (letters << 7);
    return {values, ((invalid & swar::high_bits) | (values & broadcast(0xf0))) == 0};
}

// Joins pairs of neighbours until one number is left.
template <std::uint64_t Base>
std::uint64_t join_digits(std::uint64_t values) {
    values = (values * Base + (values >> 8)) & 0x00ff00ff00ff00ff;
    values = (values * (Base * Base) + (values >> 16)) & 0x0000ffff0000ffff;
    return (values * (Base * Base * Base * Base) + (values >> 32)) & 0xffffffff;
}

// Reads one to eight digits. Inline, because saving registers for a call takes a good part of the
// time. Returns a plain number, because an optional would go through memory.
template <std::uint64_t Base>
[[gnu::always_inline]] inline std::int64_t read_word(std::string_view digits) {
    const auto [values, valid] = decode_digits<Base>(load_padded(digits));
    return valid ? static_cast<std::int64_t>(join_digits<Base>(values)) : not_parsed;
}

// Reads nine to fifteen digits, which fit signed 64 bits in either base.
template <std::uint64_t Base>
std::int64_t read_two_words(std::string_view digits) {
    constexpr std::int64_t word_base = Base * Base * Base * Base * Base * Base * Base * Base;
    const std::size_t high_length = digits.size() - word_length;
    const std::int64_t high = read_word<Base>(digits.substr(0, high_length));
    const std::int64_t low = read_word<Base>(digits.substr(high_length));
    return high == not_parsed || low == not_parsed ? not_parsed : high * word_base + low;
}

constexpr std::int64_t apply_sign(const number_parts& parts, std::int64_t magnitude) {
    // not_parsed has no negative.
    return parts.negative && magnitude != not_parsed ? -magnitude : magnitude;
}

// Not inlined into read_fast_number, so that only long numbers pay for saving registers.
[[gnu::noinline]] std::int64_t read_long_number(const number_parts& parts) {
    if (parts.digits.size() >= 2 * word_length) return not_parsed;
    return apply_sign(parts, parts.hexadecimal ? read_two_words<16>(parts.digits)
                                               : read_two_words<10>(parts.digits));
}

}  // namespace

std::int64_t read_fast_number(std::string_view text) {
    // Most values are "0x" and eight digits. Such a text is read without checking for a sign.
    if (text.size() == hex_prefix.size() + word_length && text.starts_with(hex_prefix))
        return read_word<16>(text.substr(hex_prefix.size()));
    const number_parts parts = split_number(text);
    if (parts.digits.size() > word_length) return read_long_number(parts);
    if (parts.digits.empty()) return not_parsed;
    return apply_sign(
        parts, parts.hexadecimal ? read_word<16>(parts.digits) : read_word<10>(parts.digits));
}

}  // namespace nrx
