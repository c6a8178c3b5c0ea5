#include "nrxctl/options/command_line.h"

#include <algorithm>

#include "nrxctl/nrxtoollib.h"

namespace nrx::nrxctl {

namespace {

constexpr std::string_view option_prefix = "--";

using name_list = std::span<const std::string_view>;

bool is_option(std::string_view argument) {
    return argument.starts_with(option_prefix);
}

usage_error ambiguous_option(std::string_view name, name_list names) {
    usage_error error{std::string(option_prefix).append(name).append(" is ambiguous:")};
    for (const std::string_view candidate : names) {
        if (candidate.starts_with(name))
            error.message.append(" ").append(option_prefix).append(candidate);
    }
    return error;
}

usage_error unknown_option(std::string_view argument, std::string_view name, name_list names) {
    return {std::string("unknown option ")
                .append(argument)
                .append(suggestion(name, names, option_prefix))};
}

// Returns the index of the name, or of the only name that begins with it.
std::size_t find_option(std::string_view argument, std::string_view name, name_list names) {
    const auto exact = std::find(names.begin(), names.end(), name);
    if (exact != names.end()) return static_cast<std::size_t>(exact - names.begin());
    const auto abbreviated = [&](std::string_view candidate) {
        return candidate.starts_with(name);
    };
    const auto match = std::find_if(names.begin(), names.end(), abbreviated);
    if (match == names.end() || name.empty()) throw unknown_option(argument, name, names);
    if (std::count_if(match, names.end(), abbreviated) > 1) throw ambiguous_option(name, names);
    return static_cast<std::size_t>(match - names.begin());
}

parsed_option begin_option(char* argument, name_list names) {
    const std::string_view text = argument;
    const std::size_t equals_sign = std::min(text.find('='), text.size());
    const std::string_view name =
        text.substr(option_prefix.size(), equals_sign - option_prefix.size());
    parsed_option parsed{find_option(text, name, names), {}};
    if (equals_sign < text.size()) parsed.arguments.push_back(argument + equals_sign + 1);
    return parsed;
}

usage_error not_an_option(std::string_view argument, name_list names) {
    if (argument.starts_with('-')) return unknown_option(argument, argument.substr(1), names);
    return {std::string("expected an option, not ").append(quoted(argument))};
}

}  // namespace

std::vector<parsed_option> split_command_line(std::span<char* const> arguments, name_list names) {
    std::vector<parsed_option> options;
    for (char* const argument : arguments) {
        if (is_option(argument)) {
            options.push_back(begin_option(argument, names));
        } else if (options.empty()) {
            throw not_an_option(argument, names);
        } else {
            options.back().arguments.push_back(argument);
        }
    }
    return options;
}

}  // namespace nrx::nrxctl
