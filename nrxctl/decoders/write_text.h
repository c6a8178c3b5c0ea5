// Writes pieces of text one after another, fast.
//
// Each function writes at target and returns the end of its text. The caller provides the buffer,
// with write_slack characters after the text: pieces are moved in constant sizes, and the next
// piece overwrites the excess. A width pads with spaces on the left, at most max_padding of them;
// an item longer than its width is not cut.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

#include "nrxctl/decoders/short_text.h"
#include "platform/bytes.h"

namespace nrx {

inline constexpr std::size_t max_padding = 16;
inline constexpr std::size_t write_slack = short_text::capacity;

// The length of a list of that many bytes, at most: brackets, three digits a byte, a comma after
// each but the last.
constexpr std::size_t max_list_size(std::size_t bytes) {
    return 2 + 4 * bytes;
}

inline char* write_text(char* target, const short_text& text) {
    std::memcpy(target, text.storage().data(), short_text::capacity);
    return target + text.size();
}

inline char* write_text(char* target, std::string_view text) {
    return std::copy(text.begin(), text.end(), target);
}

// The spaces before an item of the given size.
inline char* write_padding(char* target, std::size_t size, std::size_t width) {
    std::memset(target, ' ', max_padding);
    return target + (size < width ? width - size : 0);
}

// A text in single quotes; the width includes the quotes.
template <class Text>
char* write_quoted(char* target, const Text& text, std::size_t width) {
    target = write_padding(target, text.size() + 2, width);
    *target++ = '\'';
    target = write_text(target, text);
    *target++ = '\'';
    return target;
}

// A number of up to count digits in decimal, padded with zeros to count digits; count is 1 to 8.
char* write_digits(char* target, std::uint64_t value, std::size_t count);

// A number in decimal.
char* write_number(char* target, std::uint64_t value, std::size_t width);

// A number in lower-case hexadecimal and in single quotes; only the opening quote is padded to
// the width.
char* write_quoted_hex(char* target, std::uint32_t value, std::size_t width);

// A fraction as printf's %g writes it, with six significant digits.
char* write_fraction(char* target, double value, std::size_t width);

// Bytes in decimal, in brackets and with commas between them; the width is that of the list.
char* write_list(char* target, platform::byte_view bytes, std::size_t width);

}  // namespace nrx
