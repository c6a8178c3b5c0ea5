// Helpers shared by the fuzz targets.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace fuzz {

// Thrown in place of ending the process.
struct process_ended {};

// Aborts if the condition is false; the fuzzer then saves the input.
inline void require(bool condition) {
    if (!condition) std::abort();
}

// Runs an action. Returns false if it tried to end the process.
template <class Action>
bool run_to_completion(const Action& action) {
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
