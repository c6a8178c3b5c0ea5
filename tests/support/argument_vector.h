// Arguments as a program receives them.
#pragma once

#include <span>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace tests {

using lines = std::vector<std::string>;

// Splits a text at each separator. A separator at the end adds no empty piece.
inline std::vector<std::string> split(const std::string& text, char separator = ' ') {
    std::vector<std::string> pieces;
    std::istringstream stream(text);
    for (std::string piece; std::getline(stream, piece, separator);)
        pieces.push_back(piece);
    return pieces;
}

class argument_vector {
public:
    explicit argument_vector(std::vector<std::string> arguments)
        : arguments_(std::move(arguments)) {
        for (std::string& argument : arguments_)
            pointers_.push_back(argument.data());
        pointers_.push_back(nullptr);
    }
    ~argument_vector() = default;
    argument_vector(const argument_vector&) = delete;
    argument_vector& operator=(const argument_vector&) = delete;

    // The arguments.
    [[nodiscard]] std::span<char* const> span() const {
        return {pointers_.data(), arguments_.size()};
    }

    // The same, followed by a null pointer.
    [[nodiscard]] char** argv() { return pointers_.data(); }
    [[nodiscard]] int argc() const { return static_cast<int>(arguments_.size()); }

private:
    std::vector<std::string> arguments_;
    std::vector<char*> pointers_;
};

}  // namespace tests
