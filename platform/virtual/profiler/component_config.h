// How one component of the profiler is set, as configuration records carry it.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "platform/bytes.h"

namespace platform::simulated {

// A record is 52 bytes of little-endian 32-bit words in the order of the members, and one more word
// that is 0.
struct component_config {
    static constexpr std::size_t record_size = 52;

    // What the words of state mean: a component is enabled or disabled, a profiler stops with all
    // its components.
    static constexpr std::uint32_t enable = 0;
    static constexpr std::uint32_t disable = 1;
    static constexpr std::uint32_t stop = 2;

    std::uint32_t profiler = 0;
    std::uint32_t component = 0;
    std::uint32_t state = enable;
    std::uint32_t reports = 0;                   // mask
    std::array<std::uint32_t, 8> services = {};  // codes, ended by 0
};

// The whole records in a buffer; a trailing part is ignored.
std::vector<component_config> read_configs(byte_view records);

// As many records as room has space for, back to back.
std::vector<std::uint8_t> write_configs(const std::vector<component_config>& configs,
                                        std::size_t room);

}  // namespace platform::simulated
