#include "nrxctl/profiler/config_parser.h"

#include <algorithm>
#include <limits>
#include <span>
#include <string>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/numbers.h"

namespace nrx {

namespace {

using field_list = std::vector<std::string_view>;

constexpr std::string_view stop_keyword = "stop";
constexpr std::string_view all_keyword = "all";

std::uint32_t parse_u32(std::string_view argument, std::string_view message) {
    return parse_number_up_to(std::numeric_limits<std::uint32_t>::max(), argument, message);
}

// Returns the list in a field of an argument. A missing field means "all".
field_list list_in_field(const field_list& fields, std::size_t index) {
    return index < fields.size() ? split(fields[index], ',') : field_list{all_keyword};
}

std::uint32_t parse_report(std::span<const keyword_row> keywords, std::string_view report) {
    const keyword_row* row = find_keyword(keywords, report);
    if (row != nullptr) return row->number;
    const explanation_scope scope([&](explanation& given) {
        given = unknown_keyword("report", report, "expected a mask or", keywords_of(keywords));
    });
    return parse_u32(report, "report mask is invalid");
}

std::uint32_t parse_reports(std::span<const keyword_row> keywords, const field_list& reports) {
    std::uint32_t mask = 0;
    for (const std::string_view report : reports) {
        if (report != stop_keyword) mask |= parse_report(keywords, report);
    }
    return mask;
}

explanation unknown_component(const profiler_grammar& profiler, std::string_view component) {
    const std::string_view expected =
        profiler.takes_numeric_components ? " takes a number or" : " has";
    return unknown_keyword("component", component, std::string(profiler.keyword).append(expected),
                           keywords_of(profiler.components));
}

bool parse_services(const field_list& services, profiler_config& config) {
    std::size_t service_i = 0;
    for (const std::string_view service : services) {
        if (!check_explained(
                service_i < config.services.size(),
                "service_i < (sizeof(config.services) / sizeof(config.services[0]))", [&] {
                    return explanation{"too many services",
                                       "expected at most " + std::to_string(service_i)};
                })) {
            return false;
        }
        config.services[service_i++] = service_code(service);
    }
    return true;
}

// The fields of an argument.
struct config_fields {
    const profiler_grammar& profiler;
    field_list components;
    field_list reports;
    field_list services;
};

bool parse_component(const config_fields& fields, std::string_view component,
                     profiler_config& config) {
    const auto first_report =
        fields.reports.empty() ? std::nullopt : std::optional(fields.reports.front());
    const bool result = init_profiler_config(fields.profiler, component, first_report, config);
    if (!check(result, condition::result)) return false;
    const report_grammar* reports = find_report_grammar(fields.profiler, component);
    if (reports == nullptr) return true;
    config.reports = parse_reports(reports->keywords, fields.reports);
    return !reports->takes_services || parse_services(fields.services, config);
}

// Replaces "all" by the component that it stands for, if the profiler has one.
void replace_all(const profiler_grammar& profiler, field_list& components) {
    if (profiler.all_components.empty()) return;
    std::replace(components.begin(), components.end(), all_keyword, profiler.all_components);
}

}  // namespace

std::vector<std::string_view> split(std::string_view text, char delimiter) {
    std::vector<std::string_view> fields;
    while (!text.empty()) {
        const std::size_t length = std::min(text.find(delimiter), text.size());
        fields.push_back(text.substr(0, length));
        text.remove_prefix(std::min(length + 1, text.size()));
    }
    return fields;
}

bool init_profiler_config(const profiler_grammar& profiler, std::string_view component,
                          std::optional<std::string_view> first_report, profiler_config& config) {
    config = {.profiler = profiler.number};
    if (component == stop_keyword) {
        config.state = profiler_state::stop;
        return true;
    }
    const keyword_row* row = find_keyword(profiler.components, component);
    const bool enable_num_components = profiler.takes_numeric_components;
    const auto describe = [&] { return unknown_component(profiler, component); };
    if (row == nullptr &&
        !check_explained(enable_num_components, "enable_num_components", describe)) {
        return false;
    }
    const explanation_scope scope([&](explanation& given) { given = describe(); });
    config.component = row == nullptr ? parse_u32(component, "component is invalid") : row->number;
    if (first_report == stop_keyword) config.state = profiler_state::disable;
    return true;
}

bool parse_profiler_config(std::string_view argument, std::vector<profiler_config>& configs) {
    const explanation_scope scope(
        [&](explanation& given) { given.problem += " in " + quoted(argument); });
    const field_list fields = split(argument, ':');
    if (fields.size() < 2 || fields.size() > 4) {
        explain([] {
            return explanation{"wrong number of fields",
                               "expected PROFILER:COMPONENTS[:REPORTS[:SERVICES]]"};
        });
        return false;
    }
    const profiler_grammar* profiler = find_profiler_grammar(fields[0]);
    if (!check_explained(profiler, condition::never, [&] {
            return unknown_keyword("profiler", fields[0], "expected", profiler_keywords());
        })) {
        return false;
    }
    config_fields lists{*profiler, split(fields[1], ','), list_in_field(fields, 2),
                        list_in_field(fields, 3)};
    if (profiler->takes_one_component_only &&
        !check_explained(lists.components.size() == 1, "components.size() == 1", [&] {
            return explanation{"not one component",
                               std::string(fields[0]) + " takes one for each argument"};
        })) {
        return false;
    }
    replace_all(*profiler, lists.components);
    for (const std::string_view component : lists.components) {
        profiler_config config;
        if (!parse_component(lists, component, config)) return false;
        configs.push_back(config);
    }
    return true;
}

bool parse_profiler_configs(argument_cursor& arguments, std::vector<profiler_config>& configs) {
    while (const auto argument = arguments.next()) {
        const bool result = parse_profiler_config(*argument, configs);
        if (!check(result, condition::result)) return false;
    }
    return true;
}

}  // namespace nrx
