// Little-endian numbers in requests and replies of the virtual host.
#pragma once

#include <cstddef>
#include <cstdint>

#include "platform/bytes.h"

namespace platform::simulated {

// Stores the low width bytes of a number at an offset.
constexpr void store_le(byte_span bytes, std::size_t offset, std::size_t width,
                        std::uint64_t value) {
    for (std::size_t i = 0; i < width; ++i) {
        bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
    }
}

// Loads the 32-bit number at an offset.
constexpr std::uint32_t load_u32(byte_view bytes, std::size_t offset) {
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < sizeof(value); ++i) {
        value |= static_cast<std::uint32_t>(bytes[offset + i]) << (8 * i);
    }
    return value;
}

}  // namespace platform::simulated
