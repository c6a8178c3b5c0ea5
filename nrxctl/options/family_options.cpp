#include <cstdint>
#include <limits>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

option_result profile(option_arguments& arguments) {
    arguments.run_family(profile_command);
    return option_result::done;
}

option_result scm(option_arguments& arguments) {
    arguments.run_family(scm_monitor);
    return option_result::done;
}

option_result replay(option_arguments& arguments) {
    arguments.run_family(replay_command);
    return option_result::done;
}

option_result show_sensor(option_arguments& arguments) {
    std::uint32_t level = 1;
    if (const auto argument = arguments.next()) {
        constexpr auto max_level = std::numeric_limits<std::int32_t>::max();
        level = parse_number_up_to(max_level, *argument, "level is invalid");
    }
    print_sensor_info(arguments.required(), static_cast<std::int32_t>(level));
    return option_result::done;
}

}  // namespace nrx::nrxctl
