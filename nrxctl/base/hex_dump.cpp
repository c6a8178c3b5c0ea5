#include "nrxctl/base/hex_dump.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::size_t bytes_per_line = 16;
constexpr std::size_t bytes_before_gap = 8;
constexpr std::string_view separator = " | ";

// After label and space: "oooooooo: ", the pairs and their gap, the separator, the characters and
// their gap, the line feed.
constexpr std::size_t columns = 10 + 3 * bytes_per_line + 1 + 3 + bytes_per_line + 1 + 1;
constexpr std::size_t max_line = 256;
static_assert(max_dump_label + 1 + columns <= max_line);

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

char* write(char* target, std::string_view text) {
    return std::copy(text.begin(), text.end(), target);
}

char* write_offset(char* target, std::size_t offset) {
    for (int shift = 28; shift >= 0; shift -= 4) {
        *target++ = hex_digits[offset >> shift & 0xf];
    }
    return write(target, ": ");
}

char* write_pairs(char* target, platform::byte_view bytes) {
    for (std::size_t i = 0; i < bytes_per_line; ++i) {
        target = i < bytes.size() ? std::copy_n(pairs[bytes[i]].data(), 3, target)
                                  : write(target, "   ");
        if (i + 1 == bytes_before_gap) *target++ = ' ';
    }
    return target;
}

char* write_characters(char* target, platform::byte_view bytes) {
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        *target++ = characters[bytes[i]];
        if (i + 1 == bytes_before_gap) *target++ = ' ';
    }
    return target;
}

}  // namespace

void hex_dump(platform::byte_view bytes, std::string_view label) {
    std::array<char, max_line> line;
    char* start = line.data();
    if (!label.empty()) start = write(write(start, label.substr(0, max_dump_label)), " ");
    for (std::size_t offset = 0; offset < bytes.size(); offset += bytes_per_line) {
        const auto row = bytes.subspan(offset, std::min(bytes_per_line, bytes.size() - offset));
        char* end = write_pairs(write_offset(start, offset), row);
        end = write_characters(write(end, separator), row);
        *end++ = '\n';
        write_output({line.data(), static_cast<std::size_t>(end - line.data())});
    }
}

}  // namespace nrx
