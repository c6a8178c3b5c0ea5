#include "nrxctl/profiler/config_grammar.h"

#include <limits>
#include <span>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/word_table.h"
#include "nrxctl/profiler/split.h"

namespace nrx {

namespace {

using word_list = std::vector<std::string_view>;

constexpr std::string_view stop_word = "stop";
constexpr std::string_view all_word = "all";

// A word as its number; it must fit into 32 bits without a sign.
std::uint32_t parse_u32(std::string_view word, std::string_view message) {
    return parse_number_up_to(std::numeric_limits<std::uint32_t>::max(), word, message);
}

// The list in a field; a field that is not there is "all".
word_list list_in(const word_list& fields, std::size_t field) {
    return field < fields.size() ? split(fields[field], ',') : word_list{all_word};
}

std::uint32_t parse_reports(std::span<const word_number> table, const word_list& words) {
    std::uint32_t mask = 0;
    for (const std::string_view word : words) {
        if (word == stop_word) continue;
        const word_number* known = find_word_row(table, word);
        mask |= known == nullptr ? parse_u32(word, "report mask is invalid") : known->number;
    }
    return mask;
}

bool put_services(const word_list& words, profiler_config& config) {
    std::size_t service_i = 0;
    for (const std::string_view word : words) {
        if (!check(service_i < config.services.size(),
                   "service_i < (sizeof(config.services) / sizeof(config.services[0]))")) {
            return false;
        }
        config.services[service_i++] = service_code(word);
    }
    return true;
}

// What the fields of a word hold.
struct config_fields {
    const profiler_grammar& profiler;
    word_list components;
    word_list reports;
    word_list services;
};

bool parse_component(const config_fields& fields, std::string_view component,
                     profiler_config& config) {
    const auto first_report =
        fields.reports.empty() ? std::nullopt : std::optional(fields.reports.front());
    const bool result = init_profiler_config(fields.profiler, component, first_report, config);
    if (!check(result, "result")) return false;
    const report_grammar* reports = reports_of(fields.profiler, component);
    if (reports == nullptr) return true;
    config.reports = parse_reports(reports->words, fields.reports);
    return !reports->takes_services || put_services(fields.services, config);
}

// Where "all" stands for a component, it is replaced by it.
void replace_all(const profiler_grammar& profiler, word_list& components) {
    if (profiler.all_components.empty()) return;
    for (std::string_view& component : components) {
        if (component == all_word) component = profiler.all_components;
    }
}

}  // namespace

bool init_profiler_config(const profiler_grammar& profiler, std::string_view component,
                          std::optional<std::string_view> first_report, profiler_config& config) {
    config = {.profiler = profiler.number};
    if (component == stop_word) {
        config.state = profiler_state::stop;
        return true;
    }
    const word_number* known = find_word_row(profiler.components, component);
    const bool enable_num_components = profiler.takes_numeric_components;
    if (known == nullptr && !check(enable_num_components, "enable_num_components")) return false;
    config.component =
        known == nullptr ? parse_u32(component, "component is invalid") : known->number;
    if (first_report == stop_word) config.state = profiler_state::disable;
    return true;
}

bool parse_profiler_config(std::string_view word, std::vector<profiler_config>& configs) {
    const word_list fields = split(word, ':');
    if (fields.size() < 2 || fields.size() > 4) return false;
    const profiler_grammar* profiler = find_profiler_grammar(fields[0]);
    if (!check(profiler, "false")) return false;
    config_fields parts{*profiler, split(fields[1], ','), list_in(fields, 2), list_in(fields, 3)};
    if (profiler->takes_one_component_only &&
        !check(parts.components.size() == 1, "components.size() == 1")) {
        return false;
    }
    replace_all(*profiler, parts.components);
    for (const std::string_view component : parts.components) {
        profiler_config config;
        if (!parse_component(parts, component, config)) return false;
        configs.push_back(config);
    }
    return true;
}

bool parse_profiler_configs(argument_words& words, std::vector<profiler_config>& configs) {
    while (const auto word = words.take()) {
        const bool result = parse_profiler_config(*word, configs);
        if (!check(result, "result")) return false;
    }
    return true;
}

}  // namespace nrx
