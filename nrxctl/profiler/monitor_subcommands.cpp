#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/config_grammar.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/monitor.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

void monitor(argument_words& words) {
    const monitor_args args = parse_monitor_args(words);
    monitor_profiler(args.duration, select_record_printer(args.human));
}

void run_profile(argument_words& words) {
    const monitor_args args = parse_monitor_args(words);
    std::vector<profiler_config> configs;
    bool success = parse_profiler_configs(words, configs);
    if (!check(success, "success")) return;
    success = apply_profiler_configs(configs);
    if (!check(success, "success")) return;
    success = set_profiler_enabled(true);
    if (!check(success, "success")) return;
    success = monitor_profiler(args.duration, select_record_printer(args.human));
    if (!check(success, "success")) return;
    for (profiler_config& config : configs)
        config.state = profiler_state::disable;
    apply_profiler_configs(configs);
    set_profiler_enabled(false);
}

}  // namespace nrx::profile
