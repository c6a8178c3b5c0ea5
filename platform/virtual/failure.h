// How a platform call can be made to fail.
#pragma once

#include <array>

#include "platform/virtual/return_codes.h"

namespace platform::simulated {

// A call that answers with a code fails with the one named. A call that answers with an object (a
// match, a child, a property, a device) comes back without one, whichever is asked for.
enum class failure {
    io,
    unsupported,
    not_found,
    no_memory,
    nothing,  // the call reports success, and hands back no connection, no scalars, no bytes, an
              // empty name
};

inline constexpr std::array all_failures{failure::io, failure::unsupported, failure::not_found,
                                         failure::no_memory, failure::nothing};

constexpr return_code code_of(failure how) {
    switch (how) {
        case failure::io:
            return io_failure;
        case failure::unsupported:
            return platform::unsupported;
        case failure::not_found:
            return platform::not_found;
        case failure::no_memory:
            return platform::no_memory;
        case failure::nothing:
            return success;
    }
    return io_failure;
}

}  // namespace platform::simulated
