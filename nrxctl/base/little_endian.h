// Little-endian numbers in byte buffers, at any alignment.
#pragma once

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <type_traits>
#include <utility>
#include <vector>

namespace nrx {

// The number in the first sizeof(Number) bytes at source. Written as a single expression because
// compilers turn that into one load, but not a loop.
template <std::integral Number>
constexpr Number load_le(const std::uint8_t* source) {
    using bits = std::make_unsigned_t<Number>;
    return [source]<std::size_t... I>(std::index_sequence<I...>) {
        return static_cast<Number>((static_cast<bits>(bits{source[I]} << (8 * I)) | ...));
    }
    (std::make_index_sequence<sizeof(Number)>());
}

// Writes a number into the first sizeof(Number) bytes at target.
template <std::integral Number>
constexpr void store_le(std::uint8_t* target, Number value) {
    const auto bits = static_cast<std::make_unsigned_t<Number>>(value);
    for (std::size_t i = 0; i < sizeof(Number); ++i) {
        target[i] = static_cast<std::uint8_t>(bits >> (8 * i));
    }
}

// Appends the lowest bytes of a number, as many as width says, least significant first.
inline void append_le(std::vector<std::uint8_t>& bytes, std::uint64_t value, std::size_t width) {
    for (std::size_t i = 0; i < width; ++i) {
        bytes.push_back(static_cast<std::uint8_t>(value >> (8 * i)));
    }
}

// Appends 32-bit numbers, least significant byte first.
inline void append_words(std::vector<std::uint8_t>& bytes,
                         std::initializer_list<std::uint32_t> words) {
    for (const std::uint32_t word : words)
        append_le(bytes, word, sizeof(word));
}

}  // namespace nrx
