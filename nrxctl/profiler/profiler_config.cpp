#include "nrxctl/profiler/profiler_config.h"

#include "nrxctl/base/little_endian.h"

namespace nrx {

namespace {

constexpr std::size_t word_size = sizeof(std::uint32_t);
constexpr std::size_t services_offset = 16;

void append_word(std::vector<std::uint8_t>& bytes, std::uint32_t word) {
    append_le(bytes, word, word_size);
}

profiler_config decode_config(const std::uint8_t* record) {
    profiler_config config;
    config.profiler = load_le<std::uint32_t>(record);
    config.component = load_le<std::uint32_t>(record + 4);
    config.state = profiler_state{load_le<std::uint32_t>(record + 8)};
    config.reports = load_le<std::uint32_t>(record + 12);
    for (std::size_t i = 0; i < config.services.size(); ++i) {
        config.services[i] = load_le<std::uint32_t>(record + services_offset + i * word_size);
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
        append_word(bytes, config.profiler);
        append_word(bytes, config.component);
        append_word(bytes, static_cast<std::uint32_t>(config.state));
        append_word(bytes, config.reports);
        for (const std::uint32_t service : config.services)
            append_word(bytes, service);
        append_word(bytes, 0);
    }
    return bytes;
}

std::vector<profiler_config> decode_configs(platform::byte_view reply) {
    std::vector<profiler_config> configs;
    for (; reply.size() >= profiler_config::wire_size;
         reply = reply.subspan(profiler_config::wire_size)) {
        configs.push_back(decode_config(reply.data()));
    }
    return configs;
}

}  // namespace nrx
