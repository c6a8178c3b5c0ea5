// Explanations of refused arguments.
//
// The library refuses an argument with fixed messages. For a front end that wants to say more, it
// also explains: what was refused, what was expected, and which keyword is the most similar.
// Nothing is composed unless a front end listens.
//
// Process-wide, for one thread.
#pragma once

#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace nrx {

struct explanation {
    std::string problem;   // such as: unknown signal "sine"
    std::string expected;  // such as: expected random delta step sin (did you mean sin?)
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

    void add(const explanation& added);

private:
    explanation_list* previous_;
    std::vector<std::string> texts_;
};

// Changes the explanations that are given while it exists, to say where an argument stands or what
// it means there. An outer scope changes what an inner one returns.
class explanation_scope {
public:
    using rewriter = std::function<void(explanation& given)>;

    explicit explanation_scope(rewriter rewrite);
    ~explanation_scope();
    explanation_scope(const explanation_scope&) = delete;
    explanation_scope& operator=(const explanation_scope&) = delete;

    void apply(explanation& given) const;

private:
    rewriter rewrite_;
    const explanation_scope* outer_;
};

// Returns true if anybody listens.
bool explanations_wanted();

// Gives an explanation.
void add_explanation(explanation given);

// Gives the explanation that describe() returns. It is called only if anybody listens.
template <class Describe>
void explain(const Describe& describe) {
    if (explanations_wanted()) add_explanation(describe());
}

// Returns the candidate most similar to a word, or an empty text if none is similar.
std::string_view most_similar(std::string_view word, std::span<const std::string_view> candidates);

// The keywords of a table whose rows have a member `keyword`.
template <class Table>
std::vector<std::string_view> keywords_of(const Table& table) {
    std::vector<std::string_view> keywords;
    for (const auto& row : table)
        keywords.push_back(row.keyword);
    return keywords;
}

// Returns `"text"`.
std::string quoted(std::string_view text);

// Returns " (did you mean KEYWORD?)", or an empty text if no keyword is similar to the word.
std::string suggestion(std::string_view word, std::span<const std::string_view> keywords);

// An argument that is none of some keywords: `unknown KIND "WORD"; EXPECTED: KEYWORDS`, with a
// suggestion.
explanation unknown_keyword(std::string_view kind, std::string_view word, std::string_view expected,
                            std::span<const std::string_view> keywords);

}  // namespace nrx
