// Builds a line of text piece by piece.
#pragma once

#include <charconv>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace nrx {

// The digits of lower-case hexadecimal numbers.
inline constexpr std::string_view hex_digits = "0123456789abcdef";

// The base in which numbers are written.
enum class number_base { decimal, hexadecimal };

class text_line {
public:
    text_line& text(std::string_view text) {
        text_.append(text);
        return *this;
    }

    // Text padded with spaces on the left (right) to width characters; longer text is not cut.
    text_line& pad_left(std::string_view text, std::size_t width);
    text_line& pad_right(std::string_view text, std::size_t width);

    // A number in decimal, right-aligned in a field of width characters.
    template <std::integral Number>
    text_line& number(Number value, std::size_t width = 0) {
        char digits[24];
        const auto end = std::to_chars(digits, digits + sizeof(digits), value);
        return pad_left({digits, static_cast<std::size_t>(end.ptr - digits)}, width);
    }

    // A number in lower-case hexadecimal, right-aligned in a field of width characters.
    text_line& hex(std::uint64_t value, std::size_t width = 0);

    // The same, padded with zeros.
    text_line& zero_padded_hex(std::uint64_t value, std::size_t width);

    // A fraction as printf's %g writes it, with six significant digits. A value in single precision
    // is widened exactly.
    text_line& general(double value);

    // A fraction as printf's %.<digits>f writes it, with at most 20 fraction digits.
    text_line& fixed(double value, int digits);

    // Removes everything; the storage is kept for the next line.
    void clear() { text_.clear(); }

    // The text so far; valid until the next change.
    [[nodiscard]] std::string_view view() const { return text_; }

private:
    std::string text_;
};

}  // namespace nrx
