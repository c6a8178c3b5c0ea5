// The words that configurations are written in, and the numbers that they stand for.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

namespace nrx {

struct word_number {
    std::string_view word;
    std::uint32_t number;
};

// What may follow a component: the report words with their bits, and whether service words do.
struct report_grammar {
    std::span<const word_number> words;
    bool takes_services;
};

// A component word whose reports are others than those of the profiler.
struct component_reports {
    std::string_view word;
    report_grammar reports;
};

struct profiler_grammar {
    std::string_view word;
    std::uint32_t number;
    std::span<const word_number> components;
    bool takes_numeric_components = false;
    bool takes_one_component_only = false;
    std::string_view all_components = {};     // what "all" stands for; empty: nothing
    const report_grammar* reports = nullptr;  // null: no report list is read
    std::span<const component_reports> special_reports = {};
};

// The grammar of a profiler; null if no profiler has that word.
const profiler_grammar* find_profiler_grammar(std::string_view word);

// The reports that may follow a component word; null if no report list is read.
const report_grammar* reports_of(const profiler_grammar& profiler, std::string_view component);

}  // namespace nrx
