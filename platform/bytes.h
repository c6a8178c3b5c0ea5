// Byte ranges that cross the platform seam.
#pragma once

#include <cstdint>
#include <span>

namespace platform {

// Bytes to read.
using byte_view = std::span<const std::uint8_t>;

// A buffer that the callee fills.
using byte_span = std::span<std::uint8_t>;

}  // namespace platform
