// The key that begins every field of an event line.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace nrx {

// A key as it is written: a blank, the key in single quotes, a colon. The text is spelled out when
// the tool is compiled, in room of one size, so that writing it is one copy of that size.
struct field_key {
    static constexpr std::size_t room = 24;

    consteval field_key(std::string_view key) : size(static_cast<std::uint8_t>(key.size() + 4)) {
        if (key.size() + 4 > room) throw "the key is too long";
        char* end = std::copy_n(" '", 2, text.data());
        end = std::copy(key.begin(), key.end(), end);
        std::copy_n("':", 2, end);
    }
    consteval field_key(const char* key) : field_key(std::string_view(key)) {}

    std::array<char, room> text{};
    std::uint8_t size;
};

}  // namespace nrx
