#include "nrxctl/base/arguments.h"

#include <utility>

#include "nrxctl/base/end_process.h"
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

bool run_subcommand(std::span<const subcommand_row> table, std::string_view keyword,
                    argument_cursor& arguments) {
    const subcommand_row* subcommand = find_keyword(table, keyword);
    if (subcommand == nullptr) return false;
    subcommand->run(arguments);
    return true;
}

void reject_argument(std::string_view message, std::string_view argument) {
    print_line(text_line().text(message).text(" (").text(argument).text(")").view());
    end_process();
}

}  // namespace nrx
