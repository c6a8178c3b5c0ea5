#include "nrxctl/decoders/utf8.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>

namespace nrx {

namespace {

// Well-formed sequences, by their first byte. The second byte has a range of its own, which keeps
// overlong forms, surrogates and what is beyond U+10FFFF out; those behind it are 80 to bf.
struct sequence {
    std::uint8_t first_from, first_to;
    std::uint8_t second_from, second_to;
    std::uint8_t size;
};
constexpr std::array sequences{
    sequence{0xc2, 0xdf, 0x80, 0xbf, 2}, sequence{0xe0, 0xe0, 0xa0, 0xbf, 3},
    sequence{0xe1, 0xec, 0x80, 0xbf, 3}, sequence{0xed, 0xed, 0x80, 0x9f, 3},
    sequence{0xee, 0xef, 0x80, 0xbf, 3}, sequence{0xf0, 0xf0, 0x90, 0xbf, 4},
    sequence{0xf1, 0xf3, 0x80, 0xbf, 4}, sequence{0xf4, 0xf4, 0x80, 0x8f, 4},
};

bool is_between(char character, std::uint8_t from, std::uint8_t to) {
    const auto byte = static_cast<std::uint8_t>(character);
    return from <= byte && byte <= to;
}

bool is_ascii(std::string_view text) {
    char seen = 0;
    for (const char character : text)
        seen = static_cast<char>(seen | character);
    return is_between(seen, 0, 0x7f);
}

// The size of the character that text, which is not empty, begins with; 0 if it is none.
std::size_t character_size(std::string_view text) {
    if (is_between(text[0], 0, 0x7f)) return 1;
    const auto* row = std::find_if(sequences.begin(), sequences.end(), [&](const sequence& one) {
        return is_between(text[0], one.first_from, one.first_to);
    });
    if (row == sequences.end() || text.size() < row->size) return 0;
    if (!is_between(text[1], row->second_from, row->second_to)) return 0;
    const auto rest = text.substr(2, row->size - 2U);
    const bool ends_well =
        std::all_of(rest.begin(), rest.end(), [](char one) { return is_between(one, 0x80, 0xbf); });
    return ends_well ? row->size : 0;
}

}  // namespace

bool is_utf8(std::string_view text) {
    if (is_ascii(text)) return true;
    while (!text.empty()) {
        const std::size_t size = character_size(text);
        if (size == 0) return false;
        text.remove_prefix(size);
    }
    return true;
}

}  // namespace nrx
