#include "nrxctl/decoders/write_text.h"

#include <algorithm>
#include <array>
#include <bit>
#include <charconv>
#include <cstring>

#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

// Eight characters in a number, the first in the lowest byte. They are computed, shortened and
// stored without a loop or a branch.
using eight_characters = std::uint64_t;

void store(char* target, eight_characters text) {
    for (std::size_t i = 0; i < sizeof(text); ++i)
        target[i] = static_cast<char>(text >> (8 * i) & 0xff);
}

constexpr eight_characters drop_first(eight_characters text, std::size_t count) {
    return text >> (8 * count);
}

constexpr eight_characters zeros = 0x3030303030303030;

constexpr std::uint64_t eight_digit_limit = 100000000;

// Returns the eight decimal digits of a number below the limit, as values 0 to 9. The number is
// split into halves, quarters and digits, each step for all parts at once. The divisions by 100 and
// 10 are multiplications, which are exact for parts of that size.
constexpr std::uint64_t split_digits(std::uint64_t value) {
    const std::uint64_t halves = value / 10000 | value % 10000 << 32;
    const std::uint64_t hundreds = halves * 10486 >> 20 & 0x0000007f0000007f;
    const std::uint64_t quarters = hundreds | (halves - 100 * hundreds) << 16;
    const std::uint64_t tens = quarters * 103 >> 10 & 0x000f000f000f000f;
    return tens | (quarters - 10 * tens) << 8;
}

// Counts the leading zeros of eight digits; the last digit does not count.
std::size_t leading_zeros(std::uint64_t digits) {
    constexpr std::uint64_t last_digit = std::uint64_t{1} << 56;
    return static_cast<std::size_t>(std::countr_zero(digits | last_digit)) / 8;
}

// "00" to "ff", the first character in the low byte.
constexpr auto hex_pairs = [] {
    std::array<std::uint16_t, 256> table{};
    for (std::size_t i = 0; i < table.size(); ++i) {
        table[i] = static_cast<std::uint16_t>(hex_digits[i / 16] | hex_digits[i % 16] << 8);
    }
    return table;
}();

eight_characters hex_text(std::uint32_t value) {
    eight_characters text = 0;
    for (std::size_t i = 0; i < sizeof(value); ++i)
        text = text << 16 | hex_pairs[value >> (8 * i) & 0xff];
    return text;
}

// A byte in decimal, and a comma.
struct byte_text {
    std::array<char, 4> text;
    std::uint32_t size;
};
constexpr auto byte_texts = [] {
    std::array<byte_text, 256> table{};
    for (std::size_t value = 0; value < table.size(); ++value) {
        byte_text& entry = table[value];
        for (std::size_t power = 100; power > 0; power /= 10) {
            if (value < power && power > 1) continue;
            entry.text[entry.size++] = hex_digits[value / power % 10];
        }
        entry.text[entry.size++] = ',';
    }
    return table;
}();

// Shifts an item that is shorter than its width to the right end of its field.
char* align_right(char* item, char* end, std::size_t width) {
    const auto size = static_cast<std::size_t>(end - item);
    if (size >= width) return end;
    std::copy_backward(item, end, item + width);
    std::fill_n(item, width - size, ' ');
    return item + width;
}

}  // namespace

char* write_digits(char* target, std::uint64_t value, std::size_t count) {
    store(target, drop_first(split_digits(value) | zeros, 8 - count));
    return target + count;
}

char* write_number(char* target, std::uint64_t value, std::size_t width) {
    if (value >= eight_digit_limit) {
        target = write_number(target, value / eight_digit_limit,
                              width - std::min<std::size_t>(width, 8));
        return write_digits(target, value % eight_digit_limit, 8);
    }
    const std::uint64_t digits = split_digits(value);
    const std::size_t unused = leading_zeros(digits);
    target = write_padding(target, 8 - unused, width);
    store(target, drop_first(digits | zeros, unused));
    return target + 8 - unused;
}

char* write_quoted_hex(char* target, std::uint32_t value, std::size_t width) {
    const auto unused = static_cast<std::size_t>(std::countl_zero(value | 1)) / 4;
    target = write_padding(target, 1, width);
    *target++ = '\'';
    store(target, drop_first(hex_text(value), unused));
    target += 8 - unused;
    *target++ = '\'';
    return target;
}

char* write_fraction(char* target, double value, std::size_t width) {
    constexpr int significant_digits = 6;
    char* const end = std::to_chars(target, target + write_slack, value, std::chars_format::general,
                                    significant_digits)
                          .ptr;
    return align_right(target, end, width);
}

char* write_list(char* target, platform::byte_view bytes, std::size_t width) {
    char* end = target;
    *end++ = '[';
    for (const std::uint8_t byte : bytes) {
        const byte_text& entry = byte_texts[byte];
        std::memcpy(end, entry.text.data(), entry.text.size());
        end += entry.size;
    }
    if (!bytes.empty()) --end;
    *end++ = ']';
    return align_right(target, end, width);
}

}  // namespace nrx
