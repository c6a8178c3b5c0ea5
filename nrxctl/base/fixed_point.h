// The coprocessor's fractions.
#pragma once

namespace nrx {

// What 1.0 is in a signed 32-bit number with 16 fraction bits.
inline constexpr double fixed_point_one = 65536.0;

// What it is in one with 12 fraction bits.
inline constexpr double fixed_point_one_12 = 4096.0;

}  // namespace nrx
