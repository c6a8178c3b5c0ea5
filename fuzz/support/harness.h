// What fuzz targets share.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace fuzz {

// Thrown where the code under test would have ended the process.
struct process_ended {};

// Stops the fuzzer, which keeps the input, if what must hold does not.
inline void require(bool holds) {
    if (!holds) std::abort();
}

// Runs an action; whether it came to its end, that is, did not end the process.
template <class Action>
bool completes(const Action& action) {
    try {
        action();
        return true;
    } catch (const process_ended&) {
        return false;
    }
}

inline std::string_view as_text(const std::uint8_t* data, std::size_t size) {
    return {reinterpret_cast<const char*>(data), size};
}

}  // namespace fuzz
