#include "nrxctl/base/text_line.h"

#include <algorithm>
#include <limits>

namespace nrx {

namespace {

std::size_t missing(std::string_view text, std::size_t width) {
    return text.size() < width ? width - text.size() : 0;
}

}  // namespace

text_line& text_line::left(std::string_view text, std::size_t width) {
    text_.append(text).append(missing(text, width), ' ');
    return *this;
}

text_line& text_line::right(std::string_view text, std::size_t width) {
    text_.append(missing(text, width), ' ').append(text);
    return *this;
}

text_line& text_line::hex(std::uint64_t value, std::size_t width) {
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof(digits), value, 16);
    return right({digits, static_cast<std::size_t>(end.ptr - digits)}, width);
}

text_line& text_line::zero_padded_hex(std::uint64_t value, std::size_t width) {
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof(digits), value, 16);
    const std::string_view written(digits, static_cast<std::size_t>(end.ptr - digits));
    text_.append(missing(written, width), '0').append(written);
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
    constexpr int most_digits = 20;
    constexpr int longest = std::numeric_limits<double>::max_exponent10 + most_digits + 4;
    char written[longest];
    const auto end = std::to_chars(written, written + sizeof(written), value,
                                   std::chars_format::fixed, std::min(digits, most_digits));
    return text({written, static_cast<std::size_t>(end.ptr - written)});
}

}  // namespace nrx
