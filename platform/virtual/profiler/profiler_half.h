// What one half of the profiler, the kernel's or the coprocessor's, can profile and does.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "platform/return_code.h"
#include "platform/virtual/profiler/component_config.h"

namespace platform::simulated {

// A profiler that a half has, with components 0 to component_count - 1.
struct profiler_ability {
    std::uint32_t profiler;
    std::uint32_t component_count;
};

// What each half can do. The coprocessor alone sees its serial lines.
extern const std::span<const profiler_ability> kernel_abilities;
extern const std::span<const profiler_ability> coprocessor_abilities;

class profiler_half {
public:
    explicit profiler_half(std::span<const profiler_ability> abilities) : abilities_(abilities) {}

    // Carries out every configuration that the half can; unsupported if there was one that it
    // cannot.
    return_code configure(const std::vector<component_config>& configs);

    // Disables every component.
    void stop() { enabled_.clear(); }

    // The enabled components in the order in which they were first enabled.
    [[nodiscard]] const std::vector<component_config>& enabled() const { return enabled_; }

private:
    [[nodiscard]] bool can(const component_config& config) const;
    void carry_out(const component_config& config);

    std::span<const profiler_ability> abilities_;
    std::vector<component_config> enabled_;
};

}  // namespace platform::simulated
