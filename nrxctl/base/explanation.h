// Explanations of refused arguments.
//
// The library refuses an argument with fixed messages. For a front end that wants to say more, it
// also explains: what was refused, what was expected, and which keyword is the most similar.
// Nothing is composed unless a front end listens.
//
// Process-wide, for one thread.
#pragma once

#include <cstddef>
#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace nrx {

struct explanation {
    std::string problem;        // such as: unknown signal "sine"
    std::string expected = {};  // such as: expected: random delta step sin (did you mean sin?)
};

// Listens to explanations while it exists. The list created last receives them.
class explanation_list {
public:
    explanation_list();
    ~explanation_list();
    explanation_list(const explanation_list&) = delete;
    explanation_list& operator=(const explanation_list&) = delete;

    // Removes the explanations so far and returns them, in order and without repetitions, as
    // "PROBLEM; EXPECTED".
    std::vector<std::string> take();

    // Appends an explanation. Called by add_explanation.
    void add(const explanation& added);

    // Returns true if it takes no more, because nobody reads hundreds.
    [[nodiscard]] bool is_full() const { return texts_.size() >= capacity; }

private:
    static constexpr std::size_t capacity = 16;

    explanation_list* previous_;
    std::vector<std::string> texts_;
};

// Changes the explanations that are given while it exists, to say where an argument is or what
// it means there. An outer scope changes what an inner one returns.
class explanation_scope {
public:
    using rewriter = std::function<void(explanation& given)>;

    explicit explanation_scope(rewriter rewrite);
    ~explanation_scope();
    explanation_scope(const explanation_scope&) = delete;
    explanation_scope& operator=(const explanation_scope&) = delete;

    // Changes an explanation as this scope and those around it say. Called by add_explanation.
    void apply(explanation& given) const;

private:
    rewriter rewrite_;
    const explanation_scope* outer_;
};

// Returns true if anybody listens whose list is not full.
bool explanations_wanted();

// Gives an explanation. Somebody must listen.
void add_explanation(explanation given);

// Gives the explanation that describe() returns. It is called only if anybody listens.
template <class Describe>
void explain(const Describe& describe) {
    if (explanations_wanted()) add_explanation(describe());
}

// Returns the candidate most similar to a argument, or an empty text if none is similar.
std::string_view most_similar(std::string_view argument,
                              std::span<const std::string_view> candidates);

// The keywords of a table whose rows have a member `keyword`.
template <class Table>
std::vector<std::string_view> keywords_of(const Table& table) {
    std::vector<std::string_view> keywords;
    for (const auto& row : table)
        keywords.push_back(row.keyword);
    return keywords;
}

// Returns `"text"`, with control characters as \xNN.
std::string quoted(std::string_view text);

// Returns " (did you mean KEYWORD?)", with a prefix before the keyword, or an empty text if no
// keyword is similar to the argument.
std::string suggestion(std::string_view argument, std::span<const std::string_view> keywords,
                       std::string_view prefix = {});

// An argument that is none of some keywords: `unknown KIND "ARGUMENT"; EXPECTED: KEYWORDS`, with a
// suggestion.
explanation unknown_keyword(std::string_view kind, std::string_view argument,
                            std::string_view expected, std::span<const std::string_view> keywords);

}  // namespace nrx
