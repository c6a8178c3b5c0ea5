#include "platform/virtual/profiler/profiler_half.h"

#include <algorithm>
#include <array>

namespace platform::simulated {

namespace {

constexpr std::array kernel_table{
    profiler_ability{0, 6},   // exec
    profiler_ability{1, 5},   // trace
    profiler_ability{2, 7},   // sensor
    profiler_ability{3, 1},   // orrin
    profiler_ability{4, 1},   // talvor
    profiler_ability{5, 1},   // interrupt
    profiler_ability{9, 6},   // scm
    profiler_ability{10, 1},  // wake
};

constexpr std::array coprocessor_table{
    profiler_ability{0, 6}, profiler_ability{1, 5},  profiler_ability{2, 7}, profiler_ability{3, 1},
    profiler_ability{4, 1}, profiler_ability{5, 1},  profiler_ability{6, 3},  // uart
    profiler_ability{9, 6}, profiler_ability{10, 1},
};

}  // namespace

const std::span<const profiler_ability> kernel_abilities = kernel_table;
const std::span<const profiler_ability> coprocessor_abilities = coprocessor_table;

bool profiler_half::can(const component_config& config) const {
    return config.state <= component_config::stop &&
           std::any_of(abilities_.begin(), abilities_.end(), [&](const profiler_ability& ability) {
               return ability.profiler == config.profiler &&
                      config.component < ability.component_count;
           });
}

void profiler_half::carry_out(const component_config& config) {
    const auto same = [&](const component_config& other) {
        return other.profiler == config.profiler &&
               (config.state == component_config::stop || other.component == config.component);
    };
    if (config.state != component_config::enable) {
        std::erase_if(enabled_, same);
        return;
    }
    const auto found = std::find_if(enabled_.begin(), enabled_.end(), same);
    if (found == enabled_.end()) {
        enabled_.push_back(config);
    } else {
        *found = config;
    }
}

return_code profiler_half::configure(const std::vector<component_config>& configs) {
    return_code result = success;
    for (const component_config& config : configs) {
        if (can(config)) {
            carry_out(config);
        } else {
            result = unsupported;
        }
    }
    return result;
}

}  // namespace platform::simulated
