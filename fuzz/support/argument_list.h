// The input of a fuzz target as command-line arguments, one per line.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace fuzz {

// Owns arguments and offers them in the form that a program receives.
class argument_list {
public:
    explicit argument_list(std::vector<std::string> arguments);

    [[nodiscard]] std::span<char* const> arguments() const { return pointers_; }
    [[nodiscard]] int count() const { return static_cast<int>(arguments_.size()); }
    [[nodiscard]] std::string_view argument(int index) const {
        return arguments_[static_cast<std::size_t>(index)];
    }

private:
    std::vector<std::string> arguments_;
    std::vector<char*> pointers_;
};

// Splits text into lines, one argument each. An argument ends at its first NUL.
argument_list split_arguments(std::string_view text);

}  // namespace fuzz
