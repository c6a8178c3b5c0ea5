// The host's result of an operation.
#pragma once

#include <cstdint>
#include <string_view>

namespace platform {

// Signed 32 bits; 0 is success. Codes are written as their unsigned bit pattern, 0xe00002c7 say.
using return_code = std::int32_t;

// The return code with the given bit pattern.
constexpr return_code code_from_bits(std::uint32_t bits) {
    return static_cast<return_code>(bits);
}

inline constexpr return_code success = 0;

// The codes that the tool itself produces or tests.
inline constexpr return_code no_memory = code_from_bits(0xe00002bd);
inline constexpr return_code bad_argument = code_from_bits(0xe00002c2);
inline constexpr return_code unsupported = code_from_bits(0xe00002c7);
inline constexpr return_code not_found = code_from_bits(0xe00002f0);

// The host's own words for a return code. Never empty: a code that the host does not know has a
// text that says so. The text lives as long as the process.
std::string_view return_code_text(return_code code);

}  // namespace platform
