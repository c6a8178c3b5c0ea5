// Writes pieces of text, one behind the other, as fast as can be.
//
// Each function writes at to and returns where the text ends. The caller has made sure of the room,
// and of put_slack characters beyond it: pieces are moved by sizes that are known when the tool is
// compiled, and what is too much is overwritten by the next. Widths pad with blanks on the left, at
// most widest_padding of them; an item longer than its width is not cut.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

#include "nrxctl/decoders/short_text.h"
#include "platform/bytes.h"

namespace nrx {

inline constexpr std::size_t widest_padding = 16;
inline constexpr std::size_t put_slack = short_text::capacity;

// Brackets, up to three digits a byte, a comma behind each but the last.
constexpr std::size_t longest_list(std::size_t bytes) {
    return 2 + 4 * bytes;
}

inline char* put(char* to, const short_text& text) {
    std::memcpy(to, text.room().data(), short_text::capacity);
    return to + text.size();
}

inline char* put(char* to, std::string_view text) {
    return std::copy(text.begin(), text.end(), to);
}

// The blanks in front of an item of a size in a field of a width.
inline char* put_padding(char* to, std::size_t size, std::size_t width) {
    std::memset(to, ' ', widest_padding);
    return to + (size < width ? width - size : 0);
}

// A text in single quotes; the width is that of the quoted text.
template <class Text>
char* put_quoted(char* to, const Text& text, std::size_t width) {
    to = put_padding(to, text.size() + 2, width);
    *to++ = '\'';
    to = put(to, text);
    *to++ = '\'';
    return to;
}

// A number of up to count digits in decimal, zeros in front of it up to count digits; count is 1
// to 8.
char* put_digits(char* to, std::uint64_t value, std::size_t count);

// A number in decimal.
char* put_number(char* to, std::uint64_t value, std::size_t width);

// A number in lower-case hexadecimal and in single quotes; only the opening quote is padded to
// the width.
char* put_quoted_hex(char* to, std::uint32_t value, std::size_t width);

// A fraction as printf's %g writes it, with six significant digits.
char* put_fraction(char* to, double value, std::size_t width);

// Bytes in decimal, in brackets and with commas between them; the width is that of the list.
char* put_list(char* to, platform::byte_view bytes, std::size_t width);

}  // namespace nrx
