#include <cstdint>
#include <limits>
#include <optional>
#include <utility>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

namespace {

// Runs an action that may be a watch, which ends after a number of printed events, if one is given.
option_action limited(std::optional<std::uint32_t> count, option_action run) {
    return [count, run = std::move(run)] {
        set_print_limit(count);
        run();
    };
}

}  // namespace

option_action profile(option_arguments& arguments) {
    const bool is_watch = is_profile_watch(arguments.peek());
    auto run = arguments.family_action({profile_command, check_profile_command});
    if (!is_watch) return run;
    return limited(arguments.settings().use_count(), std::move(run));
}

option_action scm(option_arguments& arguments) {
    auto run = arguments.family_action({scm_monitor, check_scm_monitor});
    return limited(arguments.settings().use_count(), std::move(run));
}

option_action replay(option_arguments& arguments) {
    return arguments.family_action({replay_command, check_replay_command});
}

option_action show_sensor(option_arguments& arguments) {
    constexpr auto max_level = std::numeric_limits<std::int32_t>::max();
    const std::string_view name = arguments.next();
    const std::uint32_t level =
        arguments.at_end() ? 1 : arguments.next_number({0, max_level}, "a level");
    return [=] { print_sensor_info(name, static_cast<std::int32_t>(level)); };
}

}  // namespace nrx::nrxctl
