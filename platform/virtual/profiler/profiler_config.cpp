#include "platform/virtual/profiler/profiler_config.h"

#include <algorithm>

#include "platform/virtual/little_endian.h"

namespace platform::simulated {

// --- records ---

namespace {

constexpr std::size_t services_offset = 16;

component_config read_config(byte_view record) {
    component_config config{.profiler = load_u32(record, 0),
                            .component = load_u32(record, 4),
                            .state = load_u32(record, 8),
                            .reports = load_u32(record, 12)};
    for (std::size_t i = 0; i < config.services.size(); ++i) {
        config.services[i] = load_u32(record, services_offset + 4 * i);
    }
    return config;
}

void write_config(const component_config& config, byte_span record) {
    store_le(record, 0, 4, config.profiler);
    store_le(record, 4, 4, config.component);
    store_le(record, 8, 4, config.state);
    store_le(record, 12, 4, config.reports);
    for (std::size_t i = 0; i < config.services.size(); ++i) {
        store_le(record, services_offset + 4 * i, 4, config.services[i]);
    }
}

}  // namespace

std::vector<component_config> read_configs(byte_view records) {
    std::vector<component_config> configs;
    for (; records.size() >= component_config::record_size;
         records = records.subspan(component_config::record_size)) {
        configs.push_back(read_config(records));
    }
    return configs;
}

std::vector<std::uint8_t> write_configs(const std::vector<component_config>& configs,
                                        std::size_t capacity) {
    const std::size_t count = std::min(configs.size(), capacity / component_config::record_size);
    std::vector<std::uint8_t> records(count * component_config::record_size);
    for (std::size_t i = 0; i < count; ++i) {
        write_config(configs[i], byte_span(records).subspan(i * component_config::record_size));
    }
    return records;
}

// --- the configuration of a half ---

namespace {

constexpr std::array kernel_table{
    profiler_capability{0, 6},   // exec
    profiler_capability{1, 5},   // trace
    profiler_capability{2, 7},   // sensor
    profiler_capability{3, 1},   // orrin
    profiler_capability{4, 1},   // talvor
    profiler_capability{5, 1},   // interrupt
    profiler_capability{9, 6},   // scm
    profiler_capability{10, 1},  // wake
};

constexpr std::array coprocessor_table{
    profiler_capability{0, 6},   // exec
    profiler_capability{1, 5},   // trace
    profiler_capability{2, 7},   // sensor
    profiler_capability{3, 1},   // orrin
    profiler_capability{4, 1},   // talvor
    profiler_capability{5, 1},   // interrupt
    profiler_capability{6, 3},   // uart
    profiler_capability{9, 6},   // scm
    profiler_capability{10, 1},  // wake
};

}  // namespace

const std::span<const profiler_capability> kernel_capabilities = kernel_table;
const std::span<const profiler_capability> coprocessor_capabilities = coprocessor_table;

bool profiler_half::supports(const component_config& config) const {
    return config.state <= component_config::stop &&
           std::any_of(capabilities_.begin(), capabilities_.end(),
                       [&](const profiler_capability& capability) {
                           return capability.profiler == config.profiler &&
                                  config.component < capability.component_count;
                       });
}

void profiler_half::apply(const component_config& config) {
    const auto is_affected = [&](const component_config& other) {
        return other.profiler == config.profiler &&
               (config.state == component_config::stop || other.component == config.component);
    };
    if (config.state != component_config::enable) {
        std::erase_if(enabled_, is_affected);
        return;
    }
    const auto match = std::find_if(enabled_.begin(), enabled_.end(), is_affected);
    if (match == enabled_.end()) {
        enabled_.push_back(config);
    } else {
        *match = config;
    }
}

return_code profiler_half::configure(const std::vector<component_config>& configs) {
    return_code result = success;
    for (const component_config& config : configs) {
        if (supports(config)) {
            apply(config);
        } else {
            result = unsupported;
        }
    }
    return result;
}

}  // namespace platform::simulated
