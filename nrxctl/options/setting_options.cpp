#include <limits>
#include <unistd.h>

#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

option_action set_count(option_arguments& arguments) {
    constexpr auto max_count = std::numeric_limits<std::uint32_t>::max();
    const std::uint32_t count = arguments.next_number({1, max_count}, "a count");
    arguments.settings().set_count(count);
    return {};
}

option_action set_raw(option_arguments& arguments) {
    if (::isatty(STDOUT_FILENO) != 0)
        throw usage_error{"--raw writes bytes, which are not for a terminal; redirect the output"};
    arguments.settings().set_format(reply_format::bytes, "--raw");
    return {};
}

option_action set_hex(option_arguments& arguments) {
    arguments.settings().set_format(reply_format::dump, "--hex");
    return {};
}

}  // namespace nrx::nrxctl
