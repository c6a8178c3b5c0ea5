// Byte ranges as they are handed over the platform seam.
#pragma once

#include <cstdint>
#include <span>

namespace platform {

// Bytes that are only read.
using byte_view = std::span<const std::uint8_t>;

// Room that is filled by the callee.
using byte_span = std::span<std::uint8_t>;

}  // namespace platform
