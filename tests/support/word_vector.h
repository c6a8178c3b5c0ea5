// Words as a program gets them.
#pragma once

#include <span>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace tests {

// The pieces of a text between separators; none behind the last one, if it ends the text.
inline std::vector<std::string> split(const std::string& text, char separator = ' ') {
    std::vector<std::string> pieces;
    std::istringstream from(text);
    for (std::string piece; std::getline(from, piece, separator);)
        pieces.push_back(piece);
    return pieces;
}

class word_vector {
public:
    explicit word_vector(std::vector<std::string> words) : words_(std::move(words)) {
        for (std::string& word : words_)
            pointers_.push_back(word.data());
        pointers_.push_back(nullptr);
    }
    ~word_vector() = default;
    word_vector(const word_vector&) = delete;
    word_vector& operator=(const word_vector&) = delete;

    // All words.
    [[nodiscard]] std::span<char* const> all() const { return {pointers_.data(), words_.size()}; }

    // The same, with a null pointer behind the last one.
    [[nodiscard]] char** argv() { return pointers_.data(); }
    [[nodiscard]] int argc() const { return static_cast<int>(words_.size()); }

private:
    std::vector<std::string> words_;
    std::vector<char*> pointers_;
};

}  // namespace tests
