// The input of a fuzz target as words of a command line, one to a line.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace fuzz {

// Words as a program receives them.
class command_line {
public:
    explicit command_line(std::vector<std::string> words);

    [[nodiscard]] std::span<char* const> words() const { return pointers_; }
    [[nodiscard]] int count() const { return static_cast<int>(words_.size()); }
    [[nodiscard]] std::string_view word(int position) const {
        return words_[static_cast<std::size_t>(position)];
    }

private:
    std::vector<std::string> words_;
    std::vector<char*> pointers_;
};

// The lines of a text, each as far as a NUL, which ends a word wherever it stands.
command_line words_of(std::string_view text);

}  // namespace fuzz
