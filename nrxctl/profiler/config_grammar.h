// The grammar of configuration arguments: the keywords of each profiler and their numbers.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace nrx {

struct keyword_row {
    std::string_view keyword;
    std::uint32_t number;
};

// What may follow a component.
struct report_grammar {
    std::span<const keyword_row> keywords;  // reports and their bits
    bool takes_services;
};

// A component whose reports differ from those of its profiler.
struct component_reports {
    std::string_view keyword;
    report_grammar reports;
};

struct profiler_grammar {
    std::string_view keyword;
    std::uint32_t number;
    std::span<const keyword_row> components;
    bool takes_numeric_components = false;
    bool takes_one_component_only = false;
    std::string_view all_components = {};     // the component that "all" stands for, if any
    const report_grammar* reports = nullptr;  // null: reports and services are ignored
    std::span<const component_reports> special_reports = {};
};

// The keywords of all profilers.
std::vector<std::string_view> profiler_keywords();

// Returns the grammar of a profiler, or null if no profiler has that keyword.
const profiler_grammar* find_profiler_grammar(std::string_view keyword);

// Returns the grammar of the reports of a component, or null if reports are ignored.
const report_grammar* find_report_grammar(const profiler_grammar& profiler,
                                          std::string_view component);

}  // namespace nrx
