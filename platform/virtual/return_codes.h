// The codes that only the virtual host's own drivers answer with, and the text of every code.
#pragma once

#include "platform/return_code.h"

namespace platform::simulated {

inline constexpr return_code io_failure = code_from_bits(0xe0000401);
inline constexpr return_code no_room = code_from_bits(0xe0000402);
inline constexpr return_code nothing_queued = code_from_bits(0xe0000403);
inline constexpr return_code not_ready = code_from_bits(0xe0000405);

// A wait that nothing could ever have ended.
inline constexpr return_code endless_wait = code_from_bits(0xe0000404);

}  // namespace platform::simulated
