// Words as a program gets them.
#pragma once

#include <span>
#include <string>
#include <utility>
#include <vector>

namespace tests {

// The words of a text with commas between them.
inline std::vector<std::string> between_commas(const std::string& text) {
    std::vector<std::string> words{""};
    for (const char character : text) {
        if (character == ',') {
            words.emplace_back();
        } else {
            words.back() += character;
        }
    }
    return words;
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
