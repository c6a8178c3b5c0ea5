// The raw profile event record.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace nrx {

inline constexpr std::size_t profile_record_size = 48;

// One 48-byte event of the coprocessor's profiler, as the driver hands it over. Records follow one
// another back to back; a trailing part that is shorter is no record.
struct profile_record {
    std::array<std::uint8_t, profile_record_size> bytes;
};
static_assert(sizeof(profile_record) == profile_record_size);

// Prints one record.
using record_printer = void (*)(const profile_record& record);

}  // namespace nrx
