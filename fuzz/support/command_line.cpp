#include "fuzz/support/command_line.h"

#include <algorithm>
#include <utility>

namespace fuzz {

command_line::command_line(std::vector<std::string> words) : words_(std::move(words)) {
    for (std::string& word : words_)
        pointers_.push_back(word.data());
}

command_line words_of(std::string_view text) {
    std::vector<std::string> words;
    while (!text.empty()) {
        const std::size_t length = std::min(text.find('\n'), text.size());
        words.emplace_back(std::string(text.substr(0, length)).c_str());
        text.remove_prefix(std::min(length + 1, text.size()));
    }
    return command_line(std::move(words));
}

}  // namespace fuzz
