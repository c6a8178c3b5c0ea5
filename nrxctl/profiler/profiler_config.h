// The configuration of one profiler component, as both halves of the profiler take and return it.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "platform/bytes.h"

namespace nrx {

enum class profiler_state : std::uint32_t { enable, disable, stop };

inline constexpr std::array<std::string_view, 3> profiler_state_names{"enable", "disable", "stop"};

// On the wire a record is 52 bytes of little-endian 32-bit words, in the order of the members and
// with one more word behind them that is 0.
struct profiler_config {
    static constexpr std::size_t wire_size = 52;

    std::uint32_t profiler = 0;                     // its number, the category of its events
    std::uint32_t component = 0;                    // its number within the profiler
    profiler_state state = profiler_state::enable;  // any value in a record of the driver's
    std::uint32_t reports = 0xffffffff;             // mask, a bit per report category
    std::array<std::uint32_t, 8> services = {};     // codes, ended by the first 0
};

// The most records that a half of the profiler reports back.
inline constexpr std::size_t most_active_configs = 20;

// The first four characters of a service name, the first in the lowest byte; a shorter name is
// padded with 0.
std::uint32_t service_code(std::string_view name);

// The characters of a service code up to the first 0, at most four, with a blank before each code.
// Ends at the first code that is 0.
std::string service_text(std::span<const std::uint32_t> codes);

// Records back to back.
std::vector<std::uint8_t> encode_configs(std::span<const profiler_config> configs);

// The whole records in a reply; what is left over is ignored.
std::vector<profiler_config> decode_configs(platform::byte_view reply);

}  // namespace nrx
