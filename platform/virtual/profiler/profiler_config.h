// The configuration of the virtual profiler.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "platform/bytes.h"
#include "platform/return_code.h"

namespace platform::simulated {

// The configuration of one component. A record is 52 bytes: the members in order, as little-endian
// 32-bit words, and a final word that is 0.
struct component_config {
    static constexpr std::size_t record_size = 52;

    // States. enable and disable apply to the component, stop to all components of the profiler.
    static constexpr std::uint32_t enable = 0;
    static constexpr std::uint32_t disable = 1;
    static constexpr std::uint32_t stop = 2;

    std::uint32_t profiler = 0;
    std::uint32_t component = 0;
    std::uint32_t state = enable;
    std::uint32_t reports = 0;                   // mask
    std::array<std::uint32_t, 8> services = {};  // codes, terminated by 0
};

// Reads the complete records in a buffer and ignores a partial one at the end.
std::vector<component_config> read_configs(byte_view records);

// Writes as many records as fit into capacity bytes, back to back.
std::vector<std::uint8_t> write_configs(const std::vector<component_config>& configs,
                                        std::size_t capacity);

// A profiler that one half supports. Its components are 0 to component_count - 1.
struct profiler_capability {
    std::uint32_t profiler;
    std::uint32_t component_count;
};

// What the kernel and the coprocessor support. Only the coprocessor has serial lines.
extern const std::span<const profiler_capability> kernel_capabilities;
extern const std::span<const profiler_capability> coprocessor_capabilities;

// The components that one half, the kernel or the coprocessor, has enabled.
class profiler_half {
public:
    explicit profiler_half(std::span<const profiler_capability> capabilities)
        : capabilities_(capabilities) {}

    // Applies every supported configuration. Returns unsupported if there was another one.
    return_code configure(const std::vector<component_config>& configs);

    // Disables every component.
    void stop() { enabled_.clear(); }

    // The enabled components, in the order in which they were first enabled.
    [[nodiscard]] const std::vector<component_config>& enabled() const { return enabled_; }

private:
    [[nodiscard]] bool supports(const component_config& config) const;
    void apply(const component_config& config);

    std::span<const profiler_capability> capabilities_;
    std::vector<component_config> enabled_;
};

}  // namespace platform::simulated
