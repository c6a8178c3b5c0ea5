#include "fuzz/support/argument_list.h"

#include <algorithm>
#include <utility>

namespace fuzz {

argument_list::argument_list(std::vector<std::string> arguments)
    : arguments_(std::move(arguments)) {
    for (std::string& argument : arguments_)
        pointers_.push_back(argument.data());
}

argument_list split_arguments(std::string_view text) {
    std::vector<std::string> arguments;
    while (!text.empty()) {
        const std::size_t length = std::min(text.find('\n'), text.size());
        arguments.emplace_back(std::string(text.substr(0, length)).c_str());
        text.remove_prefix(std::min(length + 1, text.size()));
    }
    return argument_list(std::move(arguments));
}

}  // namespace fuzz
