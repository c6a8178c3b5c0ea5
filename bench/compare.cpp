// compare PAIRS LABEL RATIO MEGABYTES OURS... -- PEER...: runs two command lines alternately, PAIRS
// times each, and prints a table row: the label, the two median times, their ratio, the
// interquartile range of the ratios of all pairs, the ratio's budget, the peak memory of OURS and
// its budget. The budget "-" means no limit. Without arguments it prints the table header.
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "bench/process_cost.h"

namespace {

// The command line.
struct comparison {
    int pairs;
    std::string label;
    std::string ratio_budget;
    std::string megabytes_budget;
    std::vector<std::string> subject;
    std::vector<std::string> peer;
};

struct measurements {
    std::vector<double> subject;
    std::vector<double> peer;
    std::vector<double> ratios;  // of each pair
    double megabytes = 0;        // peak memory of the subject
};

std::optional<comparison> parse_arguments(std::span<char*> arguments) {
    constexpr std::size_t fixed_arguments = 4;
    if (arguments.size() < fixed_arguments) return std::nullopt;
    const auto commands = arguments.subspan(fixed_arguments);
    const auto separator = std::find(commands.begin(), commands.end(), std::string_view("--"));
    if (separator == commands.begin() || commands.end() - separator < 2) return std::nullopt;
    return comparison{.pairs = std::max(1, std::atoi(arguments[0])),
                      .label = arguments[1],
                      .ratio_budget = arguments[2],
                      .megabytes_budget = arguments[3],
                      .subject = {commands.begin(), separator},
                      .peer = {separator + 1, commands.end()}};
}

// Returns the value below which a fraction of the values lies.
double quantile(std::vector<double> values, double fraction) {
    std::sort(values.begin(), values.end());
    return values[static_cast<std::size_t>(fraction * static_cast<double>(values.size() - 1))];
}

double median(const std::vector<double>& values) {
    return quantile(values, 0.5);
}

measurements run(const comparison& comparison) {
    measurements results;
    // Warms the page cache with everything that the two read.
    bench::measure_process(comparison.subject);
    bench::measure_process(comparison.peer);
    for (int i = 0; i < comparison.pairs; ++i) {
        const auto subject = bench::measure_process(comparison.subject);
        const auto peer = bench::measure_process(comparison.peer);
        results.subject.push_back(subject.microseconds);
        results.peer.push_back(peer.microseconds);
        results.ratios.push_back(subject.microseconds / peer.microseconds);
        results.megabytes = std::max(results.megabytes, subject.megabytes);
    }
    return results;
}

// Returns the budget, marked if the measured value exceeds it.
std::string format_budget(double measured, const std::string& budget) {
    const bool is_exceeded = budget != "-" && measured > std::atof(budget.c_str());
    return is_exceeded ? budget + " over" : budget;
}

void print_header() {
    std::printf("%-42s %10s %10s %7s %-17s %-11s %6s %s\n", "", "ours, us", "peer, us", "ratio",
                "middle half", "budget", "MB", "budget");
}

void print_row(const comparison& comparison, const measurements& results) {
    const double ratio = median(results.subject) / median(results.peer);
    std::printf("%-42s %10.0f %10.0f %7.3f %7.3f - %-7.3f %-11s %6.2f %s\n",
                comparison.label.c_str(), median(results.subject), median(results.peer), ratio,
                quantile(results.ratios, 0.25), quantile(results.ratios, 0.75),
                format_budget(ratio, comparison.ratio_budget).c_str(), results.megabytes,
                format_budget(results.megabytes, comparison.megabytes_budget).c_str());
}

}  // namespace

int main(int argc, char** argv) {
    const std::span<char*> arguments{argv + 1, static_cast<std::size_t>(argc - 1)};
    if (arguments.empty()) {
        print_header();
        return EXIT_SUCCESS;
    }
    const auto comparison = parse_arguments(arguments);
    if (!comparison) {
        std::fputs("usage: compare PAIRS LABEL RATIO MEGABYTES OURS... -- PEER...\n", stderr);
        return EXIT_FAILURE;
    }
    print_row(*comparison, run(*comparison));
    return EXIT_SUCCESS;
}
