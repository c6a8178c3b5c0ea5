// Results of host operations.
#pragma once

#include <cstdint>
#include <string_view>

namespace platform {

// A signed 32-bit number; 0 is success. Codes are usually written as unsigned bit patterns such as
// 0xe00002c7.
using return_code = std::int32_t;

// Converts a bit pattern to a return code.
constexpr return_code code_from_bits(std::uint32_t bits) {
    return static_cast<return_code>(bits);
}

inline constexpr return_code success = 0;

// Codes that every host uses.
inline constexpr return_code no_memory = code_from_bits(0xe00002bd);
inline constexpr return_code bad_argument = code_from_bits(0xe00002c2);
inline constexpr return_code unsupported = code_from_bits(0xe00002c7);
inline constexpr return_code not_found = code_from_bits(0xe00002f0);

// The host's description of a return code. Never empty: unknown codes have a description as well.
// The text lives as long as the process.
std::string_view return_code_text(return_code code);

}  // namespace platform
