// Command-line arguments: a cursor over them, tables of keywords, and how an argument is refused.
#pragma once

#include <algorithm>
#include <cstddef>
#include <limits>
#include <optional>
#include <span>
#include <string_view>

namespace nrx {

// Reads the arguments after an option, one by one.
class argument_cursor {
public:
    // Takes the whole command line and the option parser's index, which is the position of the next
    // argument. The index advances with each argument read. Both must outlive this object.
    argument_cursor(std::span<char* const> arguments, int& index)
        : arguments_(arguments), index_(index) {}

    // Returns the next argument and advances; nullopt at the end.
    std::optional<std::string_view> next();

    // The number of arguments still to be read.
    [[nodiscard]] std::size_t remaining() const;

    // The argument that the n-th call of next() from now returns, from 0; nullopt if there is none.
    [[nodiscard]] std::optional<std::string_view> peek(std::size_t n) const;

    // Puts one argument in front of the remaining ones, such as the option's own argument.
    void prepend(std::string_view argument) { prepended_ = argument; }

private:
    std::span<char* const> arguments_;
    int& index_;
    std::optional<std::string_view> prepended_;
};

// Returns the row of a table whose member `keyword` equals the argument, or null if there is none.
template <class Table>
auto find_keyword(const Table& table, std::string_view argument) -> decltype(table.data()) {
    const auto match = std::find_if(table.begin(), table.end(),
                                    [&](const auto& row) { return row.keyword == argument; });
    return match == table.end() ? nullptr : &*match;
}

// What a check of arguments found.
enum class arguments_check {
    accepted,
    refused,      // the messages have been written that a run would write
    usage_error,  // a run would ignore or misread an argument; an explanation has been given
};

inline constexpr std::size_t unlimited_arguments = std::numeric_limits<std::size_t>::max();

// A subcommand of a command family.
struct subcommand_row {
    std::string_view keyword;
    // Reads its own arguments and reports its own failures. Leaves those beyond the maximum.
    void (*run)(argument_cursor& arguments);
    std::size_t max_arguments = 0;
    // Reads the arguments as run does, with the same messages, but does nothing else. Null if there
    // is nothing to check but their number.
    arguments_check (*check)(argument_cursor& arguments) = nullptr;
};

// Runs the subcommand with that keyword. Returns false if the table has none.
bool run_subcommand(std::span<const subcommand_row> table, std::string_view keyword,
                    argument_cursor& arguments);

// Checks the arguments of a subcommand: none may be left unread, or be one too many.
arguments_check check_subcommand(const subcommand_row& subcommand, argument_cursor& arguments);

// Returns accepted or refused.
constexpr arguments_check accepted_if(bool accepted) {
    return accepted ? arguments_check::accepted : arguments_check::refused;
}

// Prints "message (argument)" as a line on standard output and ends the process with status 1.
[[noreturn]] void reject_argument(std::string_view message, std::string_view argument);

}  // namespace nrx
