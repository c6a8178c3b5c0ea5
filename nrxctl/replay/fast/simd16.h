// Sixteen bytes of text that are compared at once: simd16, which is an SSE2 register or its
// portable twin. Both have the same members.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <initializer_list>

#include "nrxctl/replay/fast/swar.h"

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

namespace nrx {

// Works on any processor. Bit i of a result stands for byte i; bit 0 is the lowest.
class portable_simd16 {
public:
    static constexpr std::size_t size = 16;

    // Loads the sixteen bytes at source.
    explicit portable_simd16(const char* source)
        : low_(swar::load<std::uint64_t>(source)), high_(swar::load<std::uint64_t>(source + 8)) {}

    // Returns the positions at which both have the same byte.
    [[nodiscard]] std::uint32_t equal(const portable_simd16& other) const {
        return zeros(low_ ^ other.low_) | zeros(high_ ^ other.high_) << 8;
    }

    // Returns the positions of the bytes that equal any of the three.
    [[nodiscard]] std::uint32_t find(char first, char second, char third) const {
        std::uint32_t matches = 0;
        for (const char byte : {first, second, third}) {
            const std::uint64_t pattern = swar::broadcast(static_cast<std::uint8_t>(byte));
            matches |= zeros(low_ ^ pattern) | zeros(high_ ^ pattern) << 8;
        }
        return matches;
    }

private:
    // Returns the positions of the bytes that are 0. The product gathers the eight bits, one from
    // each byte, in its highest byte.
    static std::uint32_t zeros(std::uint64_t bytes) {
        const std::uint64_t nonzero = ((bytes & ~swar::high_bits) + ~swar::high_bits) | bytes;
        return static_cast<std::uint32_t>(
            ((~nonzero & swar::high_bits) >> 7) * 0x0102040810204080 >> 56);
    }

    std::uint64_t low_;
    std::uint64_t high_;
};

#if defined(__SSE2__)

class sse2_simd16 {
public:
    static constexpr std::size_t size = 16;

    explicit sse2_simd16(const char* source) { std::memcpy(&bytes_, source, size); }

    [[nodiscard]] std::uint32_t equal(const sse2_simd16& other) const {
        return to_bits(_mm_cmpeq_epi8(bytes_, other.bytes_));
    }

    [[nodiscard]] std::uint32_t find(char first, char second, char third) const {
        const auto matches = _mm_or_si128(_mm_cmpeq_epi8(bytes_, _mm_set1_epi8(first)),
                                          _mm_cmpeq_epi8(bytes_, _mm_set1_epi8(second)));
        return to_bits(_mm_or_si128(matches, _mm_cmpeq_epi8(bytes_, _mm_set1_epi8(third))));
    }

private:
    static std::uint32_t to_bits(__m128i matches) {
        return static_cast<std::uint32_t>(_mm_movemask_epi8(matches));
    }

    __m128i bytes_;
};

using simd16 = sse2_simd16;

#else

using simd16 = portable_simd16;

#endif

}  // namespace nrx
