// The digits of lower-case hexadecimal numbers.
#pragma once

#include <string_view>

namespace nrx {

inline constexpr std::string_view hex_digits = "0123456789abcdef";

}  // namespace nrx
