// Return codes of the virtual host, and the failures that can be injected into its calls.
#pragma once

#include <array>

#include "platform/return_code.h"

namespace platform::simulated {

inline constexpr return_code io_failure = code_from_bits(0xe0000401);
inline constexpr return_code buffer_too_small = code_from_bits(0xe0000402);
inline constexpr return_code queue_empty = code_from_bits(0xe0000403);
inline constexpr return_code deadlock = code_from_bits(0xe0000404);  // nothing can end the wait
inline constexpr return_code not_ready = code_from_bits(0xe0000405);

// How a platform call fails. A call that returns a code fails with the code of that name. A call
// that returns an object or a value (a match, a child, a property, a device) returns none in any
// case.
enum class failure {
    io,
    unsupported,
    not_found,
    no_memory,
    empty_result,  // reports success, but returns no connection, scalars or bytes, or an empty name
};

inline constexpr std::array all_failures{failure::io, failure::unsupported, failure::not_found,
                                         failure::no_memory, failure::empty_result};

constexpr return_code code_of(failure kind) {
    switch (kind) {
        case failure::io:
            return io_failure;
        case failure::unsupported:
            return platform::unsupported;
        case failure::not_found:
            return platform::not_found;
        case failure::no_memory:
            return platform::no_memory;
        case failure::empty_result:
            return success;
    }
    return io_failure;
}

}  // namespace platform::simulated
