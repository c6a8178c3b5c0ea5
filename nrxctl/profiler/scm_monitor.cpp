#include "nrxctl/profiler/scm_monitor.h"

#include <array>
#include <optional>
#include <vector>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/decoders/scm_packets.h"
#include "nrxctl/profiler/config_parser.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/monitor.h"

namespace nrx {

namespace {

constexpr std::array stop_configs{
    profiler_config{.profiler = profiler_number::scm, .state = profiler_state::stop},
};

void monitor_transfers(std::uint32_t duration, std::span<const profiler_config> configs) {
    bool success = send_fw_configs(configs) == platform::success;
    if (!success) print_line("Can't enable SCM profiler");
    if (!check(success, condition::success)) return;
    monitor_profiler(duration, print_scm_packet);
    success = send_fw_configs(stop_configs) == platform::success;
    check(success, condition::success);
}

struct scm_args {
    std::uint32_t duration;
    std::vector<profiler_config> configs;
};

// Returns nullopt with a failure report if there is no valid configuration.
std::optional<scm_args> read_scm_args(std::string_view duration, argument_cursor& arguments) {
    scm_args args{parse_duration(duration), {}};
    const bool success = parse_profiler_configs(arguments, args.configs);
    if (!check(success, condition::success)) return std::nullopt;
    if (!check_explained(!args.configs.empty(), "configs.size() != 0",
                         [] { return explanation{"--scm needs CONFIG..., such as scm:smb0"}; })) {
        return std::nullopt;
    }
    return args;
}

// Returns true if the profiler was enabled and must be disabled again. Interrupts are handled until
// this function returns.
bool run_monitor(std::string_view duration, argument_cursor& arguments) {
    const scoped_interrupt_handler interrupt_handler;
    if (!fw_profiler_available()) {
        print_failure("wqr fw profiler is not available");
        return false;
    }
    bool connected = false;
    const bool success = get_profiler_status(connected);
    if (!check(success, condition::success)) return false;
    const auto args = read_scm_args(duration, arguments);
    if (!args) return false;
    if (!connected) set_profiler_enabled(true);
    monitor_transfers(args->duration, args->configs);
    return !connected;
}

}  // namespace

void scm_monitor(std::string_view duration, std::span<char* const> arguments, int& index) {
    argument_cursor cursor(arguments, index);
    if (run_monitor(duration, cursor)) set_profiler_enabled(false);
}

arguments_check check_scm_monitor(std::string_view duration, std::span<char* const> arguments,
                                  int& index) {
    argument_cursor cursor(arguments, index);
    return accepted_if(read_scm_args(duration, cursor).has_value());
}

}  // namespace nrx
