#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/config_grammar.h"
#include "nrxctl/profiler/config_printer.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/profiler_conn.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

namespace {

void print_active(std::span<const profiler_config> configs) {
    if (configs.empty()) print_line("    none");
    for (const profiler_config& config : configs)
        print_profiler_config(config);
}

}  // namespace

void enable(argument_words& /*words*/) {
    set_profiler_enabled(true);
}

void disable(argument_words& /*words*/) {
    set_profiler_enabled(false);
}

void stop(argument_words& /*words*/) {
    if (fw_profiler_available()) stop_fw_profiler();
}

void flush(argument_words& /*words*/) {
    if (!fw_profiler_available()) return;
    const platform::return_code kr = flush_fw_profiler();
    check_success(kr, "kr == 0 ");
}

void configure(argument_words& words) {
    std::vector<profiler_config> configs;
    bool success = parse_profiler_configs(words, configs);
    if (!check(success, "success")) return;
    for (const profiler_config& config : configs)
        print_profiler_config(config);
    success = apply_profiler_configs(configs);
    check(success, "success");
}

void show_configs(argument_words& /*words*/) {
    profiler_conn conn;
    bool success = conn.open();
    if (!check(success, "success")) return;
    bool connected = false;
    success = get_profiler_status(connected);
    if (!check(success, "success")) return;
    print_line(connected ? "A client is connected" : "No client is connected");
    print_line("\nActive components in kext:");
    print_active(read_kernel_configs(conn));
    print_line("\nActive components in fw:");
    if (fw_profiler_available()) {
        print_active(read_fw_configs());
    } else {
        print_line("    fw profiler is not available");
    }
}

}  // namespace nrx::profile
