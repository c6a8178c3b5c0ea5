#include "nrxctl/profiler/profiler_config.h"

#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/whole_records.h"

namespace nrx {

namespace {

constexpr std::size_t word_size = sizeof(std::uint32_t);
constexpr std::size_t services_offset = 16;

profiler_config decode_config(platform::byte_view record) {
    const reply_fields fields(record);
    profiler_config config;
    config.profiler = fields.u32(0);
    config.component = fields.u32(4);
    config.state = profiler_state{fields.u32(8)};
    config.reports = fields.u32(12);
    for (std::size_t i = 0; i < config.services.size(); ++i) {
        config.services[i] = fields.u32(services_offset + i * word_size);
    }
    return config;
}

}  // namespace

std::uint32_t service_code(std::string_view name) {
    std::uint32_t code = 0;
    for (std::size_t i = 0; i < name.size() && i < word_size; ++i) {
        code |= static_cast<std::uint32_t>(static_cast<unsigned char>(name[i])) << (8 * i);
    }
    return code;
}

std::string service_text(std::span<const std::uint32_t> codes) {
    std::string text;
    for (std::uint32_t code : codes) {
        if (code == 0) break;
        text += ' ';
        for (; (code & 0xff) != 0; code >>= 8)
            text += static_cast<char>(code & 0xff);
    }
    return text;
}

std::vector<std::uint8_t> encode_configs(std::span<const profiler_config> configs) {
    std::vector<std::uint8_t> bytes;
    bytes.reserve(configs.size() * profiler_config::wire_size);
    for (const profiler_config& config : configs) {
        append_words(bytes, {config.profiler, config.component,
                             static_cast<std::uint32_t>(config.state), config.reports});
        for (const std::uint32_t service : config.services)
            append_words(bytes, {service});
        append_words(bytes, {0});
    }
    return bytes;
}

std::vector<profiler_config> decode_configs(platform::byte_view reply) {
    std::vector<profiler_config> configs;
    for_each_record(reply, profiler_config::wire_size,
                    [&](platform::byte_view record) { configs.push_back(decode_config(record)); });
    return configs;
}

}  // namespace nrx
