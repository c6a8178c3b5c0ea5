// Eight characters at a time, as the bytes of one number, the first of them the lowest.
#pragma once

#include <bit>
#include <cstdint>
#include <cstring>

namespace nrx {

// The highest bit of each byte, which no ASCII character has.
inline constexpr std::uint64_t high_bits = 0x8080808080808080;

// The byte in each of the eight places.
constexpr std::uint64_t eight_times(std::uint8_t byte) {
    return byte * std::uint64_t{0x0101010101010101};
}

// The sizeof(Number) bytes at source as a number, the first of them the lowest.
template <class Number>
std::uint64_t load_bytes(const char* source) {
    Number value;
    std::memcpy(&value, source, sizeof(Number));
    return std::endian::native == std::endian::little
               ? value
               : __builtin_bswap64(value) >> (64 - 8 * sizeof(Number));
}

}  // namespace nrx
