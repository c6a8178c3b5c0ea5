#include "nrxctl/base/hex_dump.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "nrxctl/base/hex_digits.h"
#include "nrxctl/base/output.h"

namespace nrx {

namespace {

constexpr std::size_t bytes_per_line = 16;
constexpr std::size_t bytes_before_gap = 8;
constexpr std::string_view separator = " | ";

// Label and blank, "oooooooo: ", the pairs and their gap, the separator, the characters and their
// gap, the line feed.
constexpr std::size_t columns = 10 + 3 * bytes_per_line + 1 + 3 + bytes_per_line + 1 + 1;
constexpr std::size_t longest_line = 256;
static_assert(longest_dump_label + 1 + columns <= longest_line);

// "xx " for every byte value, and the character that stands for it.
constexpr auto pairs = [] {
    std::array<std::array<char, 3>, 256> table{};
    for (std::size_t i = 0; i < table.size(); ++i) {
        table[i] = {hex_digits[i / 16], hex_digits[i % 16], ' '};
    }
    return table;
}();
constexpr auto characters = [] {
    std::array<char, 256> table{};
    for (std::size_t i = 0; i < table.size(); ++i) {
        table[i] = i > 32 && i < 127 ? static_cast<char>(i) : '.';
    }
    return table;
}();

char* put(char* to, std::string_view text) {
    return std::copy(text.begin(), text.end(), to);
}

char* put_offset(char* to, std::size_t offset) {
    for (int shift = 28; shift >= 0; shift -= 4) {
        *to++ = hex_digits[offset >> shift & 0xf];
    }
    return put(to, ": ");
}

char* put_pairs(char* to, platform::byte_view bytes) {
    for (std::size_t i = 0; i < bytes_per_line; ++i) {
        to = i < bytes.size() ? std::copy_n(pairs[bytes[i]].data(), 3, to) : put(to, "   ");
        if (i + 1 == bytes_before_gap) *to++ = ' ';
    }
    return to;
}

char* put_characters(char* to, platform::byte_view bytes) {
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        *to++ = characters[bytes[i]];
        if (i + 1 == bytes_before_gap) *to++ = ' ';
    }
    return to;
}

}  // namespace

void hex_dump(platform::byte_view bytes, std::string_view label) {
    std::array<char, longest_line> line;
    char* start = line.data();
    if (!label.empty()) start = put(put(start, label.substr(0, longest_dump_label)), " ");
    for (std::size_t offset = 0; offset < bytes.size(); offset += bytes_per_line) {
        const auto row = bytes.subspan(offset, std::min(bytes_per_line, bytes.size() - offset));
        char* end = put_pairs(put_offset(start, offset), row);
        end = put_characters(put(end, separator), row);
        *end++ = '\n';
        write_output({line.data(), static_cast<std::size_t>(end - line.data())});
    }
}

}  // namespace nrx
