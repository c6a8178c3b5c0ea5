// Builds a line of text by appending; what every printer writes with.
#pragma once

#include <charconv>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace nrx {

// The base in which numbers are written.
enum class number_base { decimal, hexadecimal };

class text_line {
public:
    text_line& text(std::string_view text) {
        text_.append(text);
        return *this;
    }

    // Text padded with blanks on the right (left) to width characters; longer text is not cut.
    text_line& left(std::string_view text, std::size_t width);
    text_line& right(std::string_view text, std::size_t width);

    // A number in decimal, right-aligned in a field of width characters.
    template <std::integral Number>
    text_line& number(Number value, std::size_t width = 0) {
        char digits[24];
        const auto end = std::to_chars(digits, digits + sizeof(digits), value);
        return right({digits, static_cast<std::size_t>(end.ptr - digits)}, width);
    }

    // A number in lower-case hexadecimal, right-aligned in a field of width characters.
    text_line& hex(std::uint64_t value, std::size_t width = 0);

    // The same, filled up with zeros.
    text_line& zero_padded_hex(std::uint64_t value, std::size_t width);

    // A fraction as printf's %g writes it, with six significant digits. A value in single precision
    // is converted exactly.
    text_line& general(double value);

    // A fraction as printf's %.<digits>f writes it, with at most 20 digits behind the point.
    text_line& fixed(double value, int digits);

    // Removes everything; the room is kept for the next line.
    void clear() { text_.clear(); }

    // The text so far; valid until the next change.
    [[nodiscard]] std::string_view view() const { return text_; }

private:
    std::string text_;
};

}  // namespace nrx
