#include "nrxctl/profiler/config_grammar.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/decoders/event_names.h"
#include "nrxctl/profiler/profiler_config.h"

namespace nrx {

namespace {

constexpr std::uint32_t every_report = 0xffffffff;
constexpr std::uint32_t low_16_reports = 0xffff;

// The keyword of a profiler is the name that the decoders give its category.
consteval std::string_view profiler_keyword(std::uint32_t number) {
    return id_name_table(category_names).find(number)->view();
}

// Components. Their keywords are the names that the decoders give them, except for "exec".

// Returns the names of a decoder's components as keywords, followed by further ones.
template <std::size_t Names, std::size_t Extras = 0>
consteval std::array<keyword_row, Names + Extras> component_keywords(
    const std::array<id_name, Names>& names, const std::array<keyword_row, Extras>& extras = {}) {
    std::array<keyword_row, Names + Extras> keywords{};
    for (std::size_t i = 0; i < Names; ++i) {
        const auto& [number, name] = names[i];
        keywords[i] = {name.view(), number};
    }
    std::copy(extras.begin(), extras.end(), keywords.begin() + Names);
    return keywords;
}

constexpr std::array exec_keywords{
    keyword_row{"thread", 0},  keyword_row{"function", 1}, keyword_row{"workloop", 2},
    keyword_row{"command", 3}, keyword_row{"packet", 3},   keyword_row{"extfunction", 4},
    keyword_row{"timing", 5},
};
constexpr auto trace_keywords =
    component_keywords(trace_components, std::array{keyword_row{"mbi", 4}});
constexpr auto sensor_keywords = component_keywords(sensor_components);
constexpr auto orrin_keywords = component_keywords(orrin_components);
constexpr auto talvor_keywords = component_keywords(talvor_components);
constexpr auto interrupt_keywords = component_keywords(interrupt_components);
constexpr auto uart_keywords = component_keywords(uart_components);
constexpr auto scm_keywords = component_keywords(scm_components);
constexpr auto wake_keywords = component_keywords(wake_components);

// Reports and their bits.

constexpr std::array command_report_keywords{
    keyword_row{"all", every_report},
    keyword_row{"command", 0x1f},
    keyword_row{"report", 0xe0},
};
constexpr std::array trace_report_keywords{keyword_row{"all", every_report}};
constexpr std::array plain_report_keywords{keyword_row{"all", low_16_reports}};
constexpr std::array sensor_report_keywords{
    keyword_row{"all", low_16_reports},
    keyword_row{"lat", 0x1},
    keyword_row{"raw", 0x2},
    keyword_row{"data", 0x4},
    keyword_row{"rdata", 0x6},
    keyword_row{"filtered", 0x8},
    keyword_row{"apdata", 0x10},
    keyword_row{"writereg", 0x20},
    keyword_row{"readreg", 0x40},
    keyword_row{"update", 0x80},
    keyword_row{"filterstate", 0x100},
    keyword_row{"sensorinfo", 0x200},
    keyword_row{"annotation", 0x400},
    keyword_row{"decimationinfo", 0x800},
    keyword_row{"t-magnitude", 0x10000},
    keyword_row{"t-latency", 0x20000},
    keyword_row{"error", 0x40000},
    keyword_row{"t-bad", 0x80000},
};
// "all" stands for the latency only; trigger latency uses a different bit here than for sensors.
constexpr std::array orrin_report_keywords{
    keyword_row{"all", 0x1},
    keyword_row{"latency", 0x1},
    keyword_row{"monitor", 0x2},
    keyword_row{"trig-lat", 0x10000},
};
constexpr std::array uart_report_keywords{
    keyword_row{"all", low_16_reports}, keyword_row{"preamble", 0x1},   keyword_row{"swhand", 0x2},
    keyword_row{"hwhand", 0x4},         keyword_row{"trace", 0x8},      keyword_row{"packet", 0x10},
    keyword_row{"baseband", 0x20},      keyword_row{"transport", 0x40}, keyword_row{"test", 0x80},
};
constexpr std::array scm_report_keywords{
    keyword_row{"all", every_report}, keyword_row{"ch0", 0x1},     keyword_row{"ch1", 0x2},
    keyword_row{"ch2", 0x4},          keyword_row{"ch3", 0x8},     keyword_row{"ch4", 0x10},
    keyword_row{"ch5", 0x20},         keyword_row{"ch6", 0x40},    keyword_row{"ch7", 0x80},
    keyword_row{"ch8", 0x100},        keyword_row{"ch9", 0x200},   keyword_row{"ch10", 0x400},
    keyword_row{"ch11", 0x800},       keyword_row{"ch12", 0x1000}, keyword_row{"ch13", 0x2000},
    keyword_row{"ch14", 0x4000},      keyword_row{"ch15", 0x8000},
};
constexpr std::array wake_report_keywords{
    keyword_row{"all", low_16_reports},
    keyword_row{"wake-req-stats", 0x1},
    keyword_row{"wake-req-info", 0x2},
    keyword_row{"wake-event-info", 0x4},
};

constexpr std::array exec_special_reports{
    component_reports{"command", {command_report_keywords, true}},
    component_reports{"packet", {command_report_keywords, true}},
    component_reports{"extfunction", {trace_report_keywords, true}},
};
constexpr report_grammar trace_reports{trace_report_keywords, true};
constexpr report_grammar sensor_reports{sensor_report_keywords, false};
constexpr report_grammar orrin_reports{orrin_report_keywords, false};
constexpr report_grammar plain_reports{plain_report_keywords, false};
constexpr report_grammar uart_reports{uart_report_keywords, false};
constexpr report_grammar scm_reports{scm_report_keywords, false};
constexpr report_grammar wake_reports{wake_report_keywords, false};

constexpr std::array profilers{
    profiler_grammar{.keyword = profiler_keyword(profiler_number::exec),
                     .number = profiler_number::exec,
                     .components = exec_keywords,
                     .takes_one_component_only = true,
                     .special_reports = exec_special_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::trace),
                     .number = profiler_number::trace,
                     .components = trace_keywords,
                     .takes_numeric_components = true,
                     .reports = &trace_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::sensor),
                     .number = profiler_number::sensor,
                     .components = sensor_keywords,
                     .reports = &sensor_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::orrin),
                     .number = profiler_number::orrin,
                     .components = orrin_keywords,
                     .reports = &orrin_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::talvor),
                     .number = profiler_number::talvor,
                     .components = talvor_keywords,
                     .reports = &plain_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::interrupt),
                     .number = profiler_number::interrupt,
                     .components = interrupt_keywords,
                     .reports = &plain_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::uart),
                     .number = profiler_number::uart,
                     .components = uart_keywords,
                     .reports = &uart_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::scm),
                     .number = profiler_number::scm,
                     .components = scm_keywords,
                     .takes_numeric_components = true,
                     .reports = &scm_reports},
    profiler_grammar{.keyword = profiler_keyword(profiler_number::wake),
                     .number = profiler_number::wake,
                     .components = wake_keywords,
                     .all_components = "wake",
                     .reports = &wake_reports},
};

}  // namespace

std::vector<std::string_view> profiler_keywords() {
    return keywords_of(profilers);
}

const profiler_grammar* find_profiler_grammar(std::string_view keyword) {
    return find_keyword(profilers, keyword);
}

const report_grammar* find_report_grammar(const profiler_grammar& profiler,
                                          std::string_view component) {
    const component_reports* special = find_keyword(profiler.special_reports, component);
    return special == nullptr ? profiler.reports : &special->reports;
}

}  // namespace nrx
