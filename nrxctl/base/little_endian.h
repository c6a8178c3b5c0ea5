// Little-endian numbers in byte buffers, wherever they stand.
#pragma once

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <type_traits>
#include <vector>

namespace nrx {

// The number in the first sizeof(Number) bytes at source.
template <std::integral Number>
constexpr Number load_le(const std::uint8_t* source) {
    std::make_unsigned_t<Number> value = 0;
    for (std::size_t i = 0; i < sizeof(Number); ++i) {
        value = static_cast<std::make_unsigned_t<Number>>(
            value | static_cast<std::make_unsigned_t<Number>>(source[i]) << (8 * i));
    }
    return static_cast<Number>(value);
}

// Writes a number into the first sizeof(Number) bytes at target.
template <std::integral Number>
constexpr void store_le(std::uint8_t* target, Number value) {
    const auto bits = static_cast<std::make_unsigned_t<Number>>(value);
    for (std::size_t i = 0; i < sizeof(Number); ++i) {
        target[i] = static_cast<std::uint8_t>(bits >> (8 * i));
    }
}

// Appends the low width bytes of a number, least significant first.
inline void append_le(std::vector<std::uint8_t>& bytes, std::uint64_t value, std::size_t width) {
    for (std::size_t i = 0; i < width; ++i) {
        bytes.push_back(static_cast<std::uint8_t>(value >> (8 * i)));
    }
}

// Appends numbers of 32 bits likewise.
inline void append_words(std::vector<std::uint8_t>& bytes,
                         std::initializer_list<std::uint32_t> words) {
    for (const std::uint32_t word : words)
        append_le(bytes, word, sizeof(word));
}

}  // namespace nrx
