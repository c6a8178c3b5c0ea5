#include "nrxctl/base/arguments.h"

#include <string>
#include <utility>

#include "nrxctl/base/end_process.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

std::size_t argument_cursor::remaining() const {
    const auto position = static_cast<std::size_t>(index_);
    const bool at_end = index_ < 0 || position >= arguments_.size();
    return (prepended_ ? 1 : 0) + (at_end ? 0 : arguments_.size() - position);
}

std::optional<std::string_view> argument_cursor::next() {
    if (prepended_) return std::exchange(prepended_, std::nullopt);
    if (remaining() == 0) return std::nullopt;
    return arguments_[static_cast<std::size_t>(index_++)];
}

std::optional<std::string_view> argument_cursor::peek(std::size_t n) const {
    if (n >= remaining()) return std::nullopt;
    if (!prepended_) return arguments_[static_cast<std::size_t>(index_) + n];
    return n == 0 ? *prepended_ : arguments_[static_cast<std::size_t>(index_) + n - 1];
}

bool run_subcommand(std::span<const subcommand_row> table, std::string_view keyword,
                    argument_cursor& arguments) {
    const subcommand_row* subcommand = find_keyword(table, keyword);
    if (subcommand == nullptr) return false;
    subcommand->run(arguments);
    return true;
}

arguments_check check_subcommand(const subcommand_row& subcommand, argument_cursor& arguments) {
    auto excess = arguments.peek(subcommand.max_arguments);
    if (subcommand.check != nullptr) {
        const arguments_check result = subcommand.check(arguments);
        if (result != arguments_check::accepted) return result;
        if (!excess) excess = arguments.next();  // such as "human" in "monitor 1 human"
    }
    if (!excess) return arguments_check::accepted;
    explain([&] {
        return explanation{"unexpected argument " + quoted(*excess) + " after " +
                           std::string(subcommand.keyword)};
    });
    return arguments_check::usage_error;
}

void reject_argument(std::string_view message, std::string_view argument) {
    print_line(text_line().text(message).text(" (").text(argument).text(")").view());
    end_process();
}

}  // namespace nrx
