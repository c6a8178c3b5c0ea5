// The codes that only the virtual host's own drivers answer with, and the text of every code.
#pragma once

#include "platform/return_code.h"

namespace platform::simulated {

inline constexpr return_code io_failure = code_from_bits(0xe0000401);
inline constexpr return_code no_room = code_from_bits(0xe0000402);

}  // namespace platform::simulated
