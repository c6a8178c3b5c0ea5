#include "nrxctl/profiler/scm_monitor.h"

#include <vector>

#include "nrxctl/base/argument_words.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/decoders/scm_packets.h"
#include "nrxctl/profiler/config_grammar.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/interrupt_stop.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/monitor.h"

namespace nrx {

namespace {

void stop_scm() {
    std::vector<profiler_config> configs;
    bool success = parse_profiler_config("scm:stop", configs);
    if (!check(success, "success")) return;
    success = send_fw_configs(configs) == platform::success;
    check(success, "success");
}

void monitor_scm(std::uint32_t duration, std::span<const profiler_config> configs) {
    const bool success = send_fw_configs(configs) == platform::success;
    if (!success) print_line("Can't enable SCM profiler");
    if (!check(success, "success")) return;
    monitor_profiler(duration, print_scm_packet);
    stop_scm();
}

// Whether the profiler was enabled for this, and is to be disabled again.
bool run(std::string_view duration_word, argument_words& words) {
    const interrupt_stop stop_while_running;
    if (!fw_profiler_available()) {
        print_line("wqr fw profiler is not available");
        return false;
    }
    bool connected = false;
    bool success = get_profiler_status(connected);
    if (!check(success, "success")) return false;
    const std::uint32_t duration = parse_duration(duration_word);
    std::vector<profiler_config> configs;
    success = parse_profiler_configs(words, configs);
    if (!check(success, "success")) return false;
    if (!check(!configs.empty(), "configs.size() != 0")) return false;
    if (!connected) set_profiler_enabled(true);
    monitor_scm(duration, configs);
    return !connected;
}

}  // namespace

void scm_monitor(std::string_view duration, std::span<char* const> words, int& index) {
    argument_words further(words, index);
    if (run(duration, further)) set_profiler_enabled(false);
}

}  // namespace nrx
