#include "nrxctl/profiler/scm_monitor.h"

#include <array>
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

// Returns true if the profiler was enabled and must be disabled again. Interrupts are handled until
// this function returns.
bool run_monitor(std::string_view duration_argument, argument_cursor& arguments) {
    const scoped_interrupt_handler interrupt_handler;
    if (!fw_profiler_available()) {
        print_line("wqr fw profiler is not available");
        return false;
    }
    bool connected = false;
    bool success = get_profiler_status(connected);
    if (!check(success, condition::success)) return false;
    const std::uint32_t duration = parse_duration(duration_argument);
    std::vector<profiler_config> configs;
    success = parse_profiler_configs(arguments, configs);
    if (!check(success, condition::success)) return false;
    if (!check(!configs.empty(), "configs.size() != 0")) return false;
    if (!connected) set_profiler_enabled(true);
    monitor_transfers(duration, configs);
    return !connected;
}

}  // namespace

void scm_monitor(std::string_view duration, std::span<char* const> arguments, int& index) {
    argument_cursor cursor(arguments, index);
    if (run_monitor(duration, cursor)) set_profiler_enabled(false);
}

}  // namespace nrx
