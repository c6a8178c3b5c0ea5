// The arguments of one option of nrxctl, and what the options before it ask for.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/command_line.h"

namespace nrx::nrxctl {

// What an option does after the whole command line has been checked. Empty if there is nothing to
// do. Failures are reported and counted by the library.
using option_action = std::function<void()>;

// How a reply is printed: with the printer of its kind, as a dump, or as its bytes.
enum class reply_format { text, dump, bytes };

// What options say about those after them, such as --count about a watch.
class option_settings {
public:
    void set_count(std::uint32_t count);
    void set_format(reply_format format, std::string_view option);

    // Return a setting, which has then been used.
    std::optional<std::uint32_t> use_count();
    reply_format use_format();

    // Throws usage_error if the latest setting of a kind has not been used.
    void check_use() const;

private:
    std::optional<std::uint32_t> count_;
    bool count_unused_ = false;
    reply_format format_ = reply_format::text;
    std::string_view unused_format_;  // the option that set it
};

struct number_range {
    std::uint32_t min;
    std::uint32_t max;
};

// The arguments of an option, read one by one. What cannot be read throws usage_error. Refers to
// the arguments and the settings; so do the actions of the options, to the arguments.
class option_arguments {
public:
    option_arguments(std::span<char* const> arguments, option_settings& settings)
        : arguments_(arguments), settings_(settings) {}

    [[nodiscard]] option_settings& settings() const { return settings_; }

    // Returns the next argument. There must be one.
    std::string_view next();

    // The argument that next() returns.
    [[nodiscard]] std::string_view peek() const { return arguments_[position()]; }

    // Returns true if all arguments have been read.
    [[nodiscard]] bool at_end() const { return position() == arguments_.size(); }

    // Reads the next argument as a number in the range. The kind is named like "a capacity".
    std::uint32_t next_number(number_range range, std::string_view kind);

    // Reads the remaining arguments as a payload (see parse_payload), which is empty if there are
    // none; a width alone is none. May end the process.
    std::vector<std::uint8_t> payload();

    // A command family of the library: a function that reads its own arguments, and one that checks
    // them.
    struct command_family {
        void (*run)(std::string_view first, std::span<char* const> arguments, int& index);
        arguments_check (*check)(std::string_view first, std::span<char* const> arguments,
                                 int& index);
    };

    // Checks all arguments, which belong to a family, and returns the action that runs it. Ends the
    // process if the library refuses them; throws usage_error if it would ignore or misread
    // some, such as a second duration or a negative count.
    option_action family_action(const command_family& family);

private:
    [[nodiscard]] std::size_t position() const { return static_cast<std::size_t>(index_); }

    std::span<char* const> arguments_;
    option_settings& settings_;
    int index_ = 0;
};

}  // namespace nrx::nrxctl
