#include "nrxctl/profiler/profiler_config.h"

#include <algorithm>

#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/name_table.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/decoders/category_decoders.h"

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

constexpr std::array state_rows{
    name_row{static_cast<std::uint32_t>(profiler_state::enable), "enable"},
    name_row{static_cast<std::uint32_t>(profiler_state::disable), "disable"},
    name_row{static_cast<std::uint32_t>(profiler_state::stop), "stop"},
};
constexpr name_table profiler_state_names(state_rows, "unknown");

short_text profiler_name_or_number(std::uint32_t profiler) {
    const profile_decoder* decoder = decoder_for_category(profiler);
    return decoder == nullptr ? id_number(profiler) : decoder->category_name(profiler);
}

short_text component_name_or_number(std::uint32_t profiler, std::uint32_t component) {
    const profile_decoder* decoder = decoder_for_category(profiler);
    return decoder == nullptr ? id_number(component) : decoder->component_name(component);
}

// Services are shown for all components of "trace", and for commands and external functions of
// "exec".
bool shows_services(const profiler_config& config) {
    constexpr std::uint32_t command = 3;
    constexpr std::uint32_t extfunction = 4;
    if (config.profiler == profiler_number::trace) return true;
    return config.profiler == profiler_number::exec &&
           (config.component == command || config.component == extfunction);
}

// Appends the characters of each service code, up to its first 0, with a space in front. The first
// code that is 0 terminates the list.
void append_services(std::span<const std::uint32_t> codes, text_line& line) {
    for (std::uint32_t code : codes) {
        if (code == 0) return;
        line.text(" ");
        for (; (code & 0xff) != 0; code >>= 8) {
            const char character = static_cast<char>(code & 0xff);
            line.text({&character, 1});
        }
    }
}

}  // namespace

std::uint32_t service_code(std::string_view name) {
    std::uint32_t code = 0;
    for (std::size_t i = 0; i < name.size() && i < word_size; ++i) {
        code |= static_cast<std::uint32_t>(static_cast<unsigned char>(name[i])) << (8 * i);
    }
    return code;
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

void print_profiler_config(const profiler_config& config) {
    constexpr std::size_t name_width = 10;
    const auto state = static_cast<std::uint32_t>(config.state);
    text_line line;
    line.text("    profiler ")
        .pad_right(profiler_name_or_number(config.profiler).view(), name_width);
    // "stopd" is part of the fixed text.
    line.text(" is ").text(profiler_state_names.name(state)).text("d [component=");
    if (config.state != profiler_state::stop) {
        line.text(component_name_or_number(config.profiler, config.component).view());
    }
    line.text(", reports=").hex(config.reports);
    if (shows_services(config)) {
        line.text(" services=");
        append_services(config.services, line);
    }
    print_line(line.text("]").view());
}

}  // namespace nrx
