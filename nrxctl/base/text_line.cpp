#include "nrxctl/base/text_line.h"

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

text_line& text_line::general(double value) {
    constexpr int significant_digits = 6;
    char digits[32];
    const auto end = std::to_chars(digits, digits + sizeof(digits), value,
                                   std::chars_format::general, significant_digits);
    return text({digits, static_cast<std::size_t>(end.ptr - digits)});
}

text_line& text_line::fixed(double value, int digits) {
    char text_of_value[400];  // the largest double has 309 digits before the point
    const auto end = std::to_chars(text_of_value, text_of_value + sizeof(text_of_value), value,
                                   std::chars_format::fixed, digits);
    return text({text_of_value, static_cast<std::size_t>(end.ptr - text_of_value)});
}

}  // namespace nrx
