#include "nrxctl/profiler/profile_command.h"

#include <array>

#include "nrxctl/base/explanation.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/monitor.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx {

namespace {

constexpr std::array usage_lines{
    "usage:",
    "    nrxctl --profile enable",
    "    nrxctl --profile disable",
    "    nrxctl --profile flush",
    "    nrxctl --profile config <profiler>:<component> ...",
    "    nrxctl --profile get-config",
    "    nrxctl --profile signal-errdump",
    "    nrxctl --profile get-logs [fwdump] [errdump]",
    "    nrxctl --profile monitor [human] [auto | <duration>]",
    "    nrxctl --profile eventsources",
    "    nrxctl --profile wqrfw-wakestats",
};

void help(argument_cursor& /*arguments*/) {
    for (const char* line : usage_lines)
        print_line(line);
}

constexpr std::array subcommands{
    subcommand_row{"help", help},
    subcommand_row{"clear-eventsources", profile::clear_event_source_statistics},
    subcommand_row{"eventsources", profile::show_event_sources},
    subcommand_row{"get-eventsources", profile::show_event_sources},
    subcommand_row{"wqrfw-wakestats", profile::show_wake_requests},
    subcommand_row{"enable", profile::enable},
    subcommand_row{"disable", profile::disable},
    subcommand_row{"stop", profile::stop},
    subcommand_row{"flush", profile::flush},
    subcommand_row{"config", profile::configure, unlimited_arguments, profile::check_configs},
    subcommand_row{"set-config", profile::configure, unlimited_arguments, profile::check_configs},
    subcommand_row{"get-config", profile::show_configs},
    subcommand_row{"monitor", profile::monitor, 2, profile::check_monitor},
    subcommand_row{"signal-errdump", profile::signal_error_dump},
    subcommand_row{"get-logs", profile::show_logs, unlimited_arguments, profile::check_log_options},
    subcommand_row{"on-error", profile::set_action_on_error, 1, profile::check_error_action},
};

bool begins_run(std::string_view argument) {
    return argument == human_keyword || argument == auto_keyword || read_number(argument);
}

}  // namespace

void profile_command(std::string_view subcommand, std::span<char* const> arguments, int& index) {
    const scoped_interrupt_handler interrupt_handler;
    argument_cursor cursor(arguments, index);
    if (run_subcommand(subcommands, subcommand, cursor)) return;
    cursor.prepend(subcommand);
    profile::run_profile(cursor);
}

std::span<const subcommand_row> profile_subcommands() {
    return subcommands;
}

arguments_check check_profile_command(std::string_view subcommand, std::span<char* const> arguments,
                                      int& index) {
    argument_cursor cursor(arguments, index);
    if (const subcommand_row* row = find_keyword(subcommands, subcommand))
        return check_subcommand(*row, cursor);
    cursor.prepend(subcommand);
    // What begins no run was probably meant as a subcommand.
    const explanation_scope scope([&](explanation& given) {
        if (begins_run(subcommand)) return;
        given = unknown_keyword("subcommand", subcommand, "expected a duration or",
                                keywords_of(subcommands));
    });
    return profile::check_run(cursor);
}

bool is_profile_watch(std::string_view subcommand) {
    const subcommand_row* row = find_keyword(subcommands, subcommand);
    return row == nullptr || row->run == profile::monitor;
}

}  // namespace nrx
