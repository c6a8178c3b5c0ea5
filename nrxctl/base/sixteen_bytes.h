// Sixteen bytes of a text at once, to search texts by the million.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <initializer_list>

#include "nrxctl/base/eight_bytes.h"

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

namespace nrx {

// As two numbers, on any processor. Bit i of a result is of byte i, the first byte's is the lowest.
class sixteen_bytes_in_halves {
public:
    static constexpr std::size_t size = 16;

    // The bytes at a place.
    explicit sixteen_bytes_in_halves(const char* source)
        : low_(load_bytes<std::uint64_t>(source)), high_(load_bytes<std::uint64_t>(source + 8)) {}

    // Which bytes are the same in both.
    [[nodiscard]] std::uint32_t equal(const sixteen_bytes_in_halves& other) const {
        return zeros(low_ ^ other.low_) | zeros(high_ ^ other.high_) << 8;
    }

    // Which bytes are any of the three.
    [[nodiscard]] std::uint32_t find(char one, char two, char three) const {
        std::uint32_t found = 0;
        for (const char byte : {one, two, three}) {
            const std::uint64_t wanted = eight_times(static_cast<std::uint8_t>(byte));
            found |= zeros(low_ ^ wanted) | zeros(high_ ^ wanted) << 8;
        }
        return found;
    }

private:
    // Which of eight bytes are 0. The product collects the bits, one of each byte, in its highest.
    static std::uint32_t zeros(std::uint64_t bytes) {
        const std::uint64_t others = ((bytes & ~high_bits) + ~high_bits) | bytes;
        return static_cast<std::uint32_t>(((~others & high_bits) >> 7) * 0x0102040810204080 >> 56);
    }

    std::uint64_t low_;
    std::uint64_t high_;
};

#if defined(__SSE2__)

// The same members, where one register holds all bytes.
class sixteen_bytes_in_register {
public:
    static constexpr std::size_t size = 16;

    explicit sixteen_bytes_in_register(const char* source) { std::memcpy(&bytes_, source, size); }

    [[nodiscard]] std::uint32_t equal(const sixteen_bytes_in_register& other) const {
        return bits_of(_mm_cmpeq_epi8(bytes_, other.bytes_));
    }

    [[nodiscard]] std::uint32_t find(char one, char two, char three) const {
        const auto found = _mm_or_si128(_mm_cmpeq_epi8(bytes_, _mm_set1_epi8(one)),
                                        _mm_cmpeq_epi8(bytes_, _mm_set1_epi8(two)));
        return bits_of(_mm_or_si128(found, _mm_cmpeq_epi8(bytes_, _mm_set1_epi8(three))));
    }

private:
    static std::uint32_t bits_of(__m128i found) {
        return static_cast<std::uint32_t>(_mm_movemask_epi8(found));
    }

    __m128i bytes_;
};

using sixteen_bytes = sixteen_bytes_in_register;

#else

using sixteen_bytes = sixteen_bytes_in_halves;

#endif

}  // namespace nrx
