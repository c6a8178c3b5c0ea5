#include "nrxctl/options/option_arguments.h"

#include <algorithm>
#include <cstddef>

#include "nrxctl/nrxtoollib.h"

namespace nrx::nrxctl {

std::optional<std::string_view> option_arguments::next() {
    const auto position = static_cast<std::size_t>(index_);
    if (position >= command_line_.size() || *command_line_[position] == '-') return std::nullopt;
    ++index_;
    return command_line_[position];
}

std::vector<std::uint8_t> option_arguments::payload() {
    std::vector<std::uint8_t> payload;
    parse_payload(command_line_, index_, payload);
    return payload;
}

void option_arguments::run_family(family_command command) {
    const auto remaining = command_line_.subspan(static_cast<std::size_t>(index_));
    const auto end =
        std::find_if(remaining.begin(), remaining.end(),
                     [](std::string_view argument) { return argument.starts_with("--"); });
    const auto family_end = static_cast<std::size_t>(end - command_line_.begin());
    command(required_, command_line_.first(family_end), index_);
    index_ = static_cast<int>(family_end);
}

}  // namespace nrx::nrxctl
