#include "nrxctl/options/options.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdlib>
#include <iterator>
#include <new>
#include <string>
#include <vector>

#include "nrxctl/options/command_line.h"
#include "nrxctl/options/messages.h"
#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

namespace {

option_action help(option_arguments& arguments);
option_action version(option_arguments& arguments);

constexpr std::array option_rows{
    option_row{"profile", "SUBCOMMAND [ARGUMENT...]", 1, unlimited_arguments,
               "control the profiler; the subcommand help shows its usage", profile},
    option_row{"scm", "DURATION CONFIG...", 1, unlimited_arguments,
               "print bus transfers for DURATION milliseconds, or auto", scm},
    option_row{"replay", "SUBCOMMAND [ARGUMENT...]", 1, unlimited_arguments,
               "play samples back in place of live ones; see the subcommand help", replay},
    option_row{"sensor", "NAME [LEVEL]", 1, 2,
               "print a sensor's configuration; at level 2 also clients and state", show_sensor},
    option_row{"list", "", 0, 0, "list the interface services with their ids", list},
    option_row{"report", "SERVICE ID [CAPACITY]", 2, 3, "read a report and print it", read_report},
    option_row{"set-report", "SERVICE ID [u8|u16|u32] VALUE...", 3, unlimited_arguments,
               "write a report", write_report},
    option_row{"command", "SERVICE CODE [u8|u16|u32] [VALUE...]", 2, unlimited_arguments,
               "send a command and dump its reply", run_command},
    option_row{"scalar", "SERVICE [SCALAR...]", 1, unlimited_arguments,
               "call the scalar method of a service", call_scalar},
    option_row{"get-property", "SERVICE NAME", 2, 2, "dump a named property of a service",
               get_property},
    option_row{"set-property", "SERVICE NAME [u8|u16|u32] VALUE...", 3, unlimited_arguments,
               "set a named property of a service", set_property},
    option_row{"hid-driver", "[u8|u16|u32] VALUE...", 1, unlimited_arguments,
               "call the HID driver and dump its reply", query_hid_driver},
    option_row{"mca", "on|off", 1, 1, "switch the MCA", set_mca},
    option_row{"spi-status", "SERVICE MODE", 2, 2,
               "print the SPI status records of a HID device until an interrupt", watch_spi},
    option_row{"events", "[SECONDS]", 0, 1, "print HID events for SECONDS, or until an interrupt",
               watch_events},
    option_row{"count", "N", 1, 1, "end each later watch after N events or records", set_count},
    option_row{"hex", "", 0, 0, "dump the later replies, even if they have a printer", set_hex},
    option_row{"raw", "", 0, 0, "write the bytes of the later replies", set_raw},
    option_row{"help", "", 0, 0, "print this help", help},
    option_row{"version", "", 0, 0, "print the version and the host", version},
};

void print_help() {
    print_line("usage: nrxctl OPTION...");
    for (const option_row& row : option_rows) {
        text_line usage;
        usage.text("  --").text(row.name).text(row.arguments.empty() ? "" : " ");
        print_line(usage.text(row.arguments).view());
        print_line(text_line().text("        ").text(row.purpose).view());
    }
    print_line("All options are checked first, then run in order. A SERVICE is a registry name");
    print_line("or a service id. VALUEs are hexadecimal, or decimal after 0d; all other numbers");
    print_line("are decimal, or hexadecimal after 0x.");
    print_line(host_line());
}

option_action help(option_arguments& /*arguments*/) {
    return print_help;
}

option_action version(option_arguments& /*arguments*/) {
    return [] {
        print_line("nrxctl " NRXCTL_VERSION);
        print_line(host_line());
    };
}

// Returns what the option does. Throws usage_error, or ends the process, if an argument is wrong.
option_action read_option(const parsed_option& parsed, option_settings& settings) {
    const option_row& row = option_rows[parsed.option];
    const auto option = [&] { return std::string("--").append(row.name); };
    if (parsed.arguments.size() < row.min_arguments)
        throw usage_error{option() + " needs " + std::string(row.arguments)};
    if (parsed.arguments.size() > row.max_arguments)
        throw usage_error{"unexpected argument " + quoted(parsed.arguments[row.max_arguments]) +
                          " after " + option()};
    option_arguments arguments(parsed.arguments, settings);
    return row.read(arguments);
}

std::vector<parsed_option> split_options(std::span<char* const> command_line) {
    std::vector<std::string_view> names;
    std::transform(option_rows.begin(), option_rows.end(), std::back_inserter(names),
                   [](const option_row& row) { return row.name; });
    return split_command_line(command_line.subspan(std::min<std::size_t>(command_line.size(), 1)),
                              names);
}

std::vector<option_action> read_options(std::span<const parsed_option> options) {
    if (options.empty()) throw usage_error{"an option is needed"};
    std::vector<option_action> actions;
    option_settings settings;
    for (const parsed_option& parsed : options)
        actions.push_back(read_option(parsed, settings));
    settings.check_use();
    return actions;
}

// Says how many records an option has not printed.
void print_unprintable_count(std::uint64_t records) {
    if (records == 0) return;
    text_line line;
    line.number(records).text(records == 1 ? " record was" : " records were");
    print_message(line.text(" not printed: the text is not UTF-8").view());
}

void run_action(const option_action& action) {
    if (!action) return;
    const std::uint64_t unprintable = unprintable_record_count();
    action();
    print_unprintable_count(unprintable_record_count() - unprintable);
}

}  // namespace

std::span<const option_row> option_table() {
    return option_rows;
}

int run(int argc, char** argv) {
    const std::uint64_t failures = failure_count();
    explanation_list explanations;
    bool completed = false;
    try {
        const auto options = split_options({argv, static_cast<std::size_t>(argc)});
        completed = run_to_completion([&] {
            const auto actions = read_options(options);
            announce_host();
            for (const option_action& action : actions) {
                run_action(action);
                print_explanations(explanations);
            }
        });
        print_explanations(explanations);
    } catch (const usage_error& error) {
        print_message(error.message + "\nTry nrxctl --help.");
        return usage_error_status;
    } catch (const std::bad_alloc&) {
        write_error("nrxctl: out of memory\n");  // without allocating more
        return EXIT_FAILURE;
    }
    const auto loss = lost_output();
    if (loss) print_message("output was lost: " + *loss);
    return completed && !loss && failure_count() == failures ? EXIT_SUCCESS : EXIT_FAILURE;
}

}  // namespace nrx::nrxctl
