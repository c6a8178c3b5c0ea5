// The words of a command line behind an option, taken one after the other.
#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <string_view>

namespace nrx {

class argument_words {
public:
    // All the words of the command line, and the option parser's index, that of the next word: it
    // goes up with every word that is taken. Both outlive this object.
    argument_words(std::span<char* const> words, int& index) : words_(words), index_(index) {}

    // The next word; none at the end.
    std::optional<std::string_view> take();

    // How many words there are to take.
    [[nodiscard]] std::size_t left() const;

    // Makes a word that came from elsewhere, as the option's own argument, the next one.
    void put_first(std::string_view word) { first_ = word; }

private:
    std::span<char* const> words_;
    int& index_;
    std::optional<std::string_view> first_;
};

}  // namespace nrx
