// compare PAIRS LABEL RATIO MEGABYTES OURS... -- PEER...: runs two command lines in turns, PAIRS
// times each, and prints a row of a table: the label, the median time of each, the ratio of the two
// with the middle half of all pairs' ratios, the budget of the ratio, the peak memory of the first,
// and its budget. A budget of "-" is none. Without words it prints the head of the table.
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "bench/process_times.h"

namespace {

struct comparison {
    int pairs;
    std::string label;
    std::string ratio_budget;
    std::string megabytes_budget;
    std::vector<std::string> ours;
    std::vector<std::string> peer;
};

// What the processes cost that ran in turns.
struct samples {
    std::vector<double> ours;
    std::vector<double> peer;
    std::vector<double> ratios;  // of each pair
    double megabytes = 0;        // the most that ours took
};

std::optional<comparison> read_arguments(std::span<char*> words) {
    constexpr std::size_t before_lines = 4;
    if (words.size() < before_lines) return std::nullopt;
    const auto lines = words.subspan(before_lines);
    const auto divider = std::find(lines.begin(), lines.end(), std::string_view("--"));
    if (divider == lines.begin() || lines.end() - divider < 2) return std::nullopt;
    return comparison{
        std::max(1, std::atoi(words[0])), words[1], words[2], words[3], {lines.begin(), divider},
        {divider + 1, lines.end()}};
}

// The value below which a share of all values lies.
double quantile(std::vector<double> values, double share) {
    std::sort(values.begin(), values.end());
    return values[static_cast<std::size_t>(share * static_cast<double>(values.size() - 1))];
}

double median(const std::vector<double>& values) {
    return quantile(values, 0.5);
}

samples run(const comparison& asked) {
    samples taken;
    // What both read is in memory from here on.
    bench::run_once(asked.ours);
    bench::run_once(asked.peer);
    for (int i = 0; i < asked.pairs; ++i) {
        const auto ours = bench::run_once(asked.ours);
        const auto peer = bench::run_once(asked.peer);
        taken.ours.push_back(ours.microseconds);
        taken.peer.push_back(peer.microseconds);
        taken.ratios.push_back(ours.microseconds / peer.microseconds);
        taken.megabytes = std::max(taken.megabytes, ours.megabytes);
    }
    return taken;
}

// A budget, and whether what was measured is over it.
std::string judged(double measured, const std::string& budget) {
    const bool over = budget != "-" && measured > std::atof(budget.c_str());
    return over ? budget + " over" : budget;
}

void print_head() {
    std::printf("%-42s %10s %10s %7s %-17s %-11s %6s %s\n", "", "ours, us", "peer, us", "ratio",
                "middle half", "budget", "MB", "budget");
}

void print_row(const comparison& asked, const samples& taken) {
    const double ratio = median(taken.ours) / median(taken.peer);
    std::printf("%-42s %10.0f %10.0f %7.3f %7.3f - %-7.3f %-11s %6.2f %s\n", asked.label.c_str(),
                median(taken.ours), median(taken.peer), ratio, quantile(taken.ratios, 0.25),
                quantile(taken.ratios, 0.75), judged(ratio, asked.ratio_budget).c_str(),
                taken.megabytes, judged(taken.megabytes, asked.megabytes_budget).c_str());
}

}  // namespace

int main(int argc, char** argv) {
    const std::span<char*> words{argv + 1, static_cast<std::size_t>(argc - 1)};
    if (words.empty()) {
        print_head();
        return EXIT_SUCCESS;
    }
    const auto asked = read_arguments(words);
    if (!asked) {
        std::fputs("usage: compare PAIRS LABEL RATIO MEGABYTES OURS... -- PEER...\n", stderr);
        return EXIT_FAILURE;
    }
    print_row(*asked, run(*asked));
    return EXIT_SUCCESS;
}
