#include "nrxctl/replay/replay_command.h"

#include <array>

#include "nrxctl/base/explanation.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/generate_samples.h"
#include "nrxctl/replay/load_samples.h"
#include "nrxctl/replay/replay_state.h"

namespace nrx {

namespace {

constexpr std::array usage_lines{
    "usage:",
    "    nrxctl --replay load <file> <completion_policy: default|periodic|stop> "
    "<location: sram|dram>",
    "    nrxctl --replay unload <service...>",
    "    nrxctl --replay schedule-enable <delay-seconds> <service...>",
    "    nrxctl --replay enable <service...>",
    "    nrxctl --replay disable <service...>",
    "    nrxctl --replay get-status",
    "    nrxctl --replay generate <service> <signal-type: random|delta|step|sin> <interval> "
    "<num_samples|frequency_hz>",
    "    nrxctl --replay help",
};

void help(argument_cursor& /*arguments*/) {
    print_replay_usage();
}

constexpr std::array subcommands{
    subcommand_row{"help", help},
    subcommand_row{"load", replay::load, 4, replay::check_load},
    subcommand_row{"unload", replay::unload, unlimited_arguments, replay::check_unload},
    subcommand_row{"schedule-enable", replay::schedule_enable, unlimited_arguments,
                   replay::check_schedule},
    subcommand_row{"enable", replay::enable, unlimited_arguments, replay::check_services},
    subcommand_row{"disable", replay::disable, unlimited_arguments, replay::check_services},
    subcommand_row{"get-status", replay::show_status},
    subcommand_row{"generate", replay::generate, 4, replay::check_generate},
};

void refuse_subcommand(std::string_view subcommand) {
    print_failure(text_line().text("Invalid subcommand ").text(subcommand).text("\n").view());
    print_replay_usage();
    explain([&] {
        return unknown_keyword("subcommand", subcommand, "expected", keywords_of(subcommands));
    });
}

}  // namespace

void print_replay_usage() {
    for (const char* line : usage_lines)
        print_line(line);
}

void replay_command(std::string_view subcommand, std::span<char* const> arguments, int& index) {
    argument_cursor cursor(arguments, index);
    if (run_subcommand(subcommands, subcommand, cursor)) return;
    refuse_subcommand(subcommand);
}

std::span<const subcommand_row> replay_subcommands() {
    return subcommands;
}

arguments_check check_replay_command(std::string_view subcommand, std::span<char* const> arguments,
                                     int& index) {
    argument_cursor cursor(arguments, index);
    if (const subcommand_row* row = find_keyword(subcommands, subcommand))
        return check_subcommand(*row, cursor);
    refuse_subcommand(subcommand);
    return arguments_check::refused;
}

}  // namespace nrx
