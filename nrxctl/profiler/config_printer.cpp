#include "nrxctl/profiler/config_printer.h"

#include <algorithm>
#include <array>

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/decoders/decoder_registry.h"

namespace nrx {

namespace {

short_text profiler_name_or_number(std::uint32_t profiler) {
    const profile_decoder* decoder = decoder_for_category(profiler);
    return decoder == nullptr ? id_number(profiler) : decoder->category_name(profiler);
}

short_text component_name_or_number(std::uint32_t profiler, std::uint32_t component) {
    const profile_decoder* decoder = decoder_for_category(profiler);
    return decoder == nullptr ? id_number(component) : decoder->component_name(component);
}

std::string_view state_word(profiler_state state) {
    const auto index = static_cast<std::size_t>(state);
    return index < profiler_state_names.size() ? profiler_state_names[index] : "unknown";
}

struct component_id {
    std::uint32_t profiler;
    std::uint32_t component;
};

// The components whose services are shown: commands and functions of "exec". Of "trace", all are.
constexpr std::array with_services{component_id{0, 3}, component_id{0, 4}};
constexpr std::uint32_t trace_profiler = 1;

bool shows_services(const profiler_config& config) {
    return config.profiler == trace_profiler ||
           std::any_of(with_services.begin(), with_services.end(), [&](const component_id& one) {
               return one.profiler == config.profiler && one.component == config.component;
           });
}

}  // namespace

void print_profiler_config(const profiler_config& config) {
    constexpr std::size_t name_width = 10;
    text_line line;
    line.text("    profiler ").left(profiler_name_or_number(config.profiler).view(), name_width);
    // "stopd" is what this line has always said.
    line.text(" is ").text(state_word(config.state)).text("d [component=");
    if (config.state != profiler_state::stop) {
        line.text(component_name_or_number(config.profiler, config.component).view());
    }
    line.text(", reports=").hex(config.reports);
    if (shows_services(config)) line.text(" services=").text(service_text(config.services));
    print_line(line.text("]").view());
}

}  // namespace nrx
