// The command line of nrxctl, taken apart into options.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace nrx::nrxctl {

// What is wrong with a command line. Thrown while it is parsed.
struct usage_error {
    std::string message;
};

// An option and the arguments that follow it.
struct parsed_option {
    std::size_t option;            // index in the list of names
    std::vector<char*> arguments;  // up to the next argument that begins with "--"
};

// Takes the arguments after the program's name apart. An option is "--" and a name, or the
// beginning of one name only; "=" and a first argument may follow directly. Throws usage_error if
// an argument is no such option, or belongs to none.
std::vector<parsed_option> split_command_line(std::span<char* const> arguments,
                                              std::span<const std::string_view> names);

}  // namespace nrx::nrxctl
