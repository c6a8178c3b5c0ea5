#include "nrxctl/base/utf8.h"

#include <algorithm>
#include <array>
#include <cstdint>

namespace nrx {

namespace {

struct byte_range {
    std::uint8_t first;
    std::uint8_t last;

    [[nodiscard]] constexpr bool contains(char character) const {
        const auto byte = static_cast<std::uint8_t>(character);
        return first <= byte && byte <= last;
    }
};

constexpr byte_range ascii{0x00, 0x7f};
constexpr byte_range continuation{0x80, 0xbf};

// Well-formed sequences by their first byte. The range of the second byte excludes overlong forms,
// surrogates and everything beyond U+10FFFF; the other bytes are continuation bytes.
struct sequence {
    byte_range first_byte;
    byte_range second_byte;
    std::uint8_t size;
};
constexpr std::array sequences{
    sequence{{0xc2, 0xdf}, {0x80, 0xbf}, 2}, sequence{{0xe0, 0xe0}, {0xa0, 0xbf}, 3},
    sequence{{0xe1, 0xec}, {0x80, 0xbf}, 3}, sequence{{0xed, 0xed}, {0x80, 0x9f}, 3},
    sequence{{0xee, 0xef}, {0x80, 0xbf}, 3}, sequence{{0xf0, 0xf0}, {0x90, 0xbf}, 4},
    sequence{{0xf1, 0xf3}, {0x80, 0xbf}, 4}, sequence{{0xf4, 0xf4}, {0x80, 0x8f}, 4},
};

bool is_ascii(std::string_view text) {
    char combined = 0;
    for (const char character : text)
        combined = static_cast<char>(combined | character);
    return ascii.contains(combined);
}

}  // namespace

std::size_t utf8_character_size(std::string_view text) {
    if (text.empty()) return 0;
    if (ascii.contains(text[0])) return 1;
    const auto* match = std::find_if(sequences.begin(), sequences.end(), [&](const auto& row) {
        return row.first_byte.contains(text[0]);
    });
    if (match == sequences.end() || text.size() < match->size) return 0;
    if (!match->second_byte.contains(text[1])) return 0;
    const auto rest = text.substr(2, match->size - 2U);
    const bool valid = std::all_of(rest.begin(), rest.end(),
                                   [](char byte) { return continuation.contains(byte); });
    return valid ? match->size : 0;
}

bool is_utf8(std::string_view text) {
    if (is_ascii(text)) return true;
    while (!text.empty()) {
        const std::size_t size = utf8_character_size(text);
        if (size == 0) return false;
        text.remove_prefix(size);
    }
    return true;
}

}  // namespace nrx
