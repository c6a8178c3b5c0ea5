#include "nrxctl/options/options.h"

#include <array>
#include <cstddef>
#include <cstdlib>
#include <getopt.h>
#include <span>
#include <string>
#include <string_view>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

namespace {

option_result help(option_arguments& arguments);

option_result version(option_arguments& /*arguments*/) {
    print_line("nrxctl " NRXCTL_VERSION);
    return option_result::done;
}

struct option_row {
    const char* name;
    bool requires_argument;
    const char* arguments;
    const char* purpose;
    option_result (*run)(option_arguments& arguments);
};

constexpr std::array option_rows{
    option_row{"profile", true, "SUBCOMMAND [WORD...]",
               "control the profiler; the subcommand help shows its usage", profile},
    option_row{"scm", true, "DURATION CONFIG...",
               "print the coprocessor's bus transfers for DURATION milliseconds, or auto", scm},
    option_row{"replay", true, "SUBCOMMAND [WORD...]",
               "play samples back in place of live ones; the subcommand help lists the others",
               replay},
    option_row{"sensor", true, "NAME [LEVEL]",
               "print a sensor's configuration; at level 2 also its clients and state",
               show_sensor},
    option_row{"list", false, "", "list the interface services with their ids", list},
    option_row{"report", true, "SERVICE ID [CAPACITY]", "read a report and print it", read_report},
    option_row{"set-report", true, "SERVICE ID [u8|u16|u32] VALUE...", "write a report",
               write_report},
    option_row{"command", true, "SERVICE CODE [u8|u16|u32] [VALUE...]",
               "send a command and dump its reply", run_command},
    option_row{"scalar", true, "SERVICE [SCALAR...]", "call the scalar method of a service",
               call_scalar},
    option_row{"get-property", true, "SERVICE NAME", "dump a named property of a service",
               get_property},
    option_row{"set-property", true, "SERVICE NAME [u8|u16|u32] VALUE...",
               "set a named property of a service", set_property},
    option_row{"hid-driver", false, "[u8|u16|u32] VALUE...",
               "call the HID driver and dump its reply", query_hid_driver},
    option_row{"mca", true, "on|off", "switch the MCA", set_mca},
    option_row{"spi-status", true, "SERVICE MODE",
               "print the SPI status records of a HID device until an interrupt", watch_spi},
    option_row{"events", false, "[SECONDS]", "print HID events, for so long or until an interrupt",
               watch_events},
    option_row{"help", false, "", "print this help", help},
    option_row{"version", false, "", "print the version", version},
};

option_result help(option_arguments& /*arguments*/) {
    constexpr std::size_t usage_width = 50;
    print_line("usage: nrxctl OPTION...");
    for (const option_row& row : option_rows) {
        text_line usage;
        usage.text("--").text(row.name).text(" ").text(row.arguments);
        text_line line;
        line.text("  ").pad_right(usage.view(), usage_width).text(" ").text(row.purpose);
        print_line(line.view());
    }
    print_line("Options are carried out in order. A SERVICE is a registry name or a service id;");
    print_line("VALUEs are hexadecimal, or decimal after 0d; all other numbers are decimal, or");
    print_line("hexadecimal after 0x.");
    return option_result::done;
}

// Reports a usage error on standard error and returns the exit status for it.
int report_usage_error(std::string_view message) {
    constexpr int usage_error_status = 2;
    text_line lines;
    lines.text("nrxctl: ").text(message).text("\nTry nrxctl --help.\n");
    write_error(lines.view());
    return usage_error_status;
}

int report_missing_argument(std::string_view option) {
    return report_usage_error(text_line().text("a word is missing after ").text(option).view());
}

int report_unknown_option(std::string_view option) {
    return report_usage_error(text_line().text("unknown option ").text(option).view());
}

int report_unknown_argument(std::string_view argument) {
    return report_usage_error(text_line().text("unknown word ").text(argument).view());
}

// Returns the table of the option parser. The value of an option is the number of its row.
std::array<option, option_rows.size() + 1> parser_options() {
    std::array<option, option_rows.size() + 1> options{};
    std::size_t number = 0;
    for (const option_row& row : option_rows) {
        options[number] = {row.name, row.requires_argument ? required_argument : no_argument,
                           nullptr, static_cast<int>(number)};
        ++number;
    }
    return options;
}

}  // namespace

int run(int argc, char** argv) {
    const std::span<char* const> command_line(argv, static_cast<std::size_t>(argc));
    const auto options = parser_options();
    int status = EXIT_SUCCESS;
    bool has_options = false;
    while (true) {
        const auto position = static_cast<std::size_t>(optind);
        const int value = getopt_long(argc, argv, "+:", options.data(), nullptr);
        if (value == -1) break;
        if (value == ':') return report_missing_argument(command_line[position]);
        if (value == '?') return report_unknown_option(command_line[position]);
        has_options = true;
        const option_row& row = option_rows[static_cast<std::size_t>(value)];
        option_arguments arguments{optarg == nullptr ? "" : optarg, command_line, optind};
        const option_result result = row.run(arguments);
        if (result == option_result::usage_error)
            return report_missing_argument(std::string("--") + row.name);
        if (result == option_result::failed) status = EXIT_FAILURE;
    }
    if (optind < argc) return report_unknown_argument(argv[optind]);
    return has_options ? status : report_usage_error("an option is needed");
}

}  // namespace nrx::nrxctl
