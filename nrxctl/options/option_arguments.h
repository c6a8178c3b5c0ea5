// The arguments of one option of nrxctl, and how the option ended.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

#include "platform/return_code.h"

namespace nrx::nrxctl {

// How an option ended. The command families, --sensor and the watch of SPI status records report
// their failures themselves and always end with done. A usage error is a missing argument.
enum class option_result { done, failed, usage_error };

inline option_result result_of(platform::return_code code) {
    return code == platform::success ? option_result::done : option_result::failed;
}

// What follows an option on the command line. Reading an argument advances the option parser.
class option_arguments {
public:
    // Takes the argument that the option requires (empty if it requires none), the whole command
    // line, and the option parser's index, which is the position of the next argument.
    option_arguments(std::string_view required, std::span<char* const> command_line, int& index)
        : required_(required), command_line_(command_line), index_(index) {}

    [[nodiscard]] std::string_view required() const { return required_; }

    // Returns the next argument and advances; nullopt at the end and before the next option.
    std::optional<std::string_view> next();

    // Reads all arguments before the next option as a payload (see parse_payload). It is empty if
    // there are none.
    std::vector<std::uint8_t> payload();

    // A command family: a function of the library that reads its own arguments.
    using family_command = void (*)(std::string_view required, std::span<char* const> arguments,
                                    int& index);

    // Runs a command family on the arguments before the next long option. Skips those that it
    // leaves unread, because it does not need them or has failed.
    void run_family(family_command command);

private:
    std::string_view required_;
    std::span<char* const> command_line_;
    int& index_;
};

}  // namespace nrx::nrxctl
