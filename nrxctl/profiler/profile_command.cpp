#include "nrxctl/profiler/profile_command.h"

#include <array>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/output.h"
#include "nrxctl/profiler/kernel_profiler.h"
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
    subcommand_row{"config", profile::configure},
    subcommand_row{"set-config", profile::configure},
    subcommand_row{"get-config", profile::show_configs},
    subcommand_row{"monitor", profile::monitor},
    subcommand_row{"signal-errdump", profile::signal_error_dump},
    subcommand_row{"get-logs", profile::show_logs},
    subcommand_row{"on-error", profile::set_action_on_error},
};

}  // namespace

void profile_command(std::string_view subcommand, std::span<char* const> arguments, int& index) {
    const scoped_interrupt_handler interrupt_handler;
    argument_cursor cursor(arguments, index);
    if (run_subcommand(subcommands, subcommand, cursor)) return;
    cursor.prepend(subcommand);
    profile::run_profile(cursor);
}

}  // namespace nrx
