#include "nrxctl/base/text_line.h"

#include <algorithm>
#include <limits>

namespace nrx {

namespace {

std::size_t padding(std::string_view text, std::size_t width) {
    return text.size() < width ? width - text.size() : 0;
}

}  // namespace

text_line& text_line::pad_right(std::string_view text, std::size_t width) {
    text_.append(text).append(padding(text, width), ' ');
    return *this;
}

text_line& text_line::pad_left(std::string_view text, std::size_t width) {
    text_.append(padding(text, width), ' ').append(text);
    return *this;
}

text_line& text_line::hex(std::uint64_t value, std::size_t width) {
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof(digits), value, 16);
    return pad_left({digits, static_cast<std::size_t>(end.ptr - digits)}, width);
}

text_line& text_line::zero_padded_hex(std::uint64_t value, std::size_t width) {
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof(digits), value, 16);
    const std::string_view number(digits, static_cast<std::size_t>(end.ptr - digits));
    text_.append(padding(number, width), '0').append(number);
    return *this;
}

text_line& text_line::general(double value) {
    constexpr int significant_digits = 6;
    char digits[32];
    const auto end = std::to_chars(digits, digits + sizeof(digits), value,
                                   std::chars_format::general, significant_digits);
    return text({digits, static_cast<std::size_t>(end.ptr - digits)});
}

text_line& text_line::fixed(double value, int digits) {
    constexpr int max_digits = 20;
    constexpr int max_length = std::numeric_limits<double>::max_exponent10 + max_digits + 4;
    char number[max_length];
    const auto end = std::to_chars(number, number + sizeof(number), value, std::chars_format::fixed,
                                   std::min(digits, max_digits));
    return text({number, static_cast<std::size_t>(end.ptr - number)});
}

}  // namespace nrx
