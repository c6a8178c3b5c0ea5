#include "platform/virtual/profiler/component_config.h"

#include <algorithm>

#include "platform/virtual/little_endian.h"

namespace platform::simulated {

namespace {

constexpr std::size_t services_offset = 16;

component_config read_config(byte_view record) {
    component_config config{.profiler = get_u32(record, 0),
                            .component = get_u32(record, 4),
                            .state = get_u32(record, 8),
                            .reports = get_u32(record, 12)};
    for (std::size_t i = 0; i < config.services.size(); ++i) {
        config.services[i] = get_u32(record, services_offset + 4 * i);
    }
    return config;
}

void write_config(const component_config& config, byte_span record) {
    put_le(record, 0, 4, config.profiler);
    put_le(record, 4, 4, config.component);
    put_le(record, 8, 4, config.state);
    put_le(record, 12, 4, config.reports);
    for (std::size_t i = 0; i < config.services.size(); ++i) {
        put_le(record, services_offset + 4 * i, 4, config.services[i]);
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
                                        std::size_t room) {
    const std::size_t count = std::min(configs.size(), room / component_config::record_size);
    std::vector<std::uint8_t> records(count * component_config::record_size);
    for (std::size_t i = 0; i < count; ++i) {
        write_config(configs[i], byte_span(records).subspan(i * component_config::record_size));
    }
    return records;
}

}  // namespace platform::simulated
