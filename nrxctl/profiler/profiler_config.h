// The configuration of one profiler component: its wire format, which both halves of the profiler
// share, and its text.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "platform/bytes.h"

namespace nrx {

// The profilers. Their numbers are the categories of their events.
namespace profiler_number {

inline constexpr std::uint32_t exec = 0;
inline constexpr std::uint32_t trace = 1;
inline constexpr std::uint32_t sensor = 2;
inline constexpr std::uint32_t orrin = 3;
inline constexpr std::uint32_t talvor = 4;
inline constexpr std::uint32_t interrupt = 5;
inline constexpr std::uint32_t uart = 6;
inline constexpr std::uint32_t scm = 9;
inline constexpr std::uint32_t wake = 10;

}  // namespace profiler_number

enum class profiler_state : std::uint32_t { enable, disable, stop };

// A record on the wire is 52 bytes: little-endian 32-bit words in the order of the members,
// followed by a word that is 0.
struct profiler_config {
    static constexpr std::size_t wire_size = 52;

    std::uint32_t profiler = 0;                     // a profiler_number, if the driver sends one
    std::uint32_t component = 0;                    // as the profiler numbers its components
    profiler_state state = profiler_state::enable;  // the driver may send any value
    std::uint32_t reports = 0xffffffff;             // mask, one bit per kind of report
    std::array<std::uint32_t, 8> services = {};     // service codes, terminated by the first 0
};

// The number of records that a half of the profiler returns at most.
inline constexpr std::size_t max_active_configs = 20;

// Returns the first four characters of a service name, the first in the lowest byte. A shorter name
// is padded with zeros.
std::uint32_t service_code(std::string_view name);

// Returns the records, one after the other.
std::vector<std::uint8_t> encode_configs(std::span<const profiler_config> configs);

// Returns the complete records of a reply. Trailing bytes are ignored.
std::vector<profiler_config> decode_configs(platform::byte_view reply);

// Prints a configuration as a line on standard output. Profilers and components have the names that
// the decoders give them.
void print_profiler_config(const profiler_config& config);

}  // namespace nrx
