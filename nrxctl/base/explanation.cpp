#include "nrxctl/base/explanation.h"

#include <algorithm>
#include <cstddef>
#include <numeric>
#include <utility>

#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

explanation_list* current_list = nullptr;
const explanation_scope* innermost_scope = nullptr;

// The number of characters to insert, remove or replace to turn one text into the other.
std::size_t edit_distance(std::string_view a, std::string_view b) {
    std::vector<std::size_t> row(b.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 0; i < a.size(); ++i) {
        std::size_t diagonal = std::exchange(row[0], i + 1);
        for (std::size_t j = 0; j < b.size(); ++j) {
            const std::size_t replaced = diagonal + (a[i] == b[j] ? 0 : 1);
            diagonal = row[j + 1];
            row[j + 1] = std::min({replaced, diagonal + 1, row[j] + 1});
        }
    }
    return row[b.size()];
}

}  // namespace

explanation_list::explanation_list() : previous_(std::exchange(current_list, this)) {
}

explanation_list::~explanation_list() {
    current_list = previous_;
}

std::vector<std::string> explanation_list::take() {
    return std::exchange(texts_, {});
}

void explanation_list::add(const explanation& added) {
    std::string text = added.problem;
    if (!added.expected.empty()) text.append("; ").append(added.expected);
    if (std::find(texts_.begin(), texts_.end(), text) == texts_.end())
        texts_.push_back(std::move(text));
}

explanation_scope::explanation_scope(rewriter rewrite)
    : rewrite_(std::move(rewrite)), outer_(std::exchange(innermost_scope, this)) {
}

explanation_scope::~explanation_scope() {
    innermost_scope = outer_;
}

void explanation_scope::apply(explanation& given) const {
    rewrite_(given);
    if (outer_ != nullptr) outer_->apply(given);
}

bool explanations_wanted() {
    return current_list != nullptr && !current_list->is_full();
}

void add_explanation(explanation given) {
    if (innermost_scope != nullptr) innermost_scope->apply(given);
    current_list->add(given);
}

std::string_view most_similar(std::string_view argument,
                              std::span<const std::string_view> candidates) {
    std::string_view best;
    std::size_t best_distance =
        1 + argument.size() / 3;  // the largest distance of a similar argument
    for (const std::string_view candidate : candidates) {
        const std::size_t distance = edit_distance(argument, candidate);
        if (distance >= candidate.size() || distance > best_distance) continue;
        if (!best.empty() && distance == best_distance) continue;
        best = candidate;
        best_distance = distance;
    }
    return best;
}

std::string quoted(std::string_view text) {
    text_line line;
    line.text("\"");
    for (const char& character : text) {
        const auto code = static_cast<unsigned char>(character);
        if (code < ' ' || code == 0x7f) {
            line.text("\\x").zero_padded_hex(code, 2);
        } else {
            line.text({&character, 1});
        }
    }
    return std::string(line.text("\"").view());
}

std::string suggestion(std::string_view argument, std::span<const std::string_view> keywords,
                       std::string_view prefix) {
    const std::string_view similar = most_similar(argument, keywords);
    if (similar.empty()) return {};
    return std::string(" (did you mean ").append(prefix).append(similar).append("?)");
}

explanation unknown_keyword(std::string_view kind, std::string_view argument,
                            std::string_view expected, std::span<const std::string_view> keywords) {
    explanation text{std::string("unknown ").append(kind).append(" ").append(quoted(argument)),
                     std::string(expected).append(":")};
    for (const std::string_view keyword : keywords)
        text.expected.append(" ").append(keyword);
    text.expected.append(suggestion(argument, keywords));
    return text;
}

}  // namespace nrx
