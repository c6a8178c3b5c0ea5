// SIMD within a register: eight characters as the bytes of one number, the first character in the
// lowest byte.
#pragma once

#include <bit>
#include <cstdint>
#include <cstring>

namespace nrx::swar {

// The highest bit of each byte, which is 0 in every ASCII character.
inline constexpr std::uint64_t high_bits = 0x8080808080808080;

// Returns a number with the same byte in all eight positions.
constexpr std::uint64_t broadcast(std::uint8_t byte) {
    return byte * std::uint64_t{0x0101010101010101};
}

// Returns the sizeof(Number) bytes at source as a number, the first of them the lowest.
template <class Number>
std::uint64_t load(const char* source) {
    Number value;
    std::memcpy(&value, source, sizeof(Number));
    return std::endian::native == std::endian::little
               ? value
               : __builtin_bswap64(value) >> (64 - 8 * sizeof(Number));
}

}  // namespace nrx::swar
