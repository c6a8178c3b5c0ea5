// nrxctl: the entry points of the tool library as command-line options.

#include <array>
#include <cstdlib>
#include <getopt.h>
#include <span>
#include <string>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/driver_options.h"
#include "nrxctl/options/family_options.h"
#include "nrxctl/options/option_words.h"
#include "nrxctl/options/service_options.h"
#include "nrxctl/options/watch_options.h"
#include "platform/clock.h"

namespace {

using namespace nrx;
using namespace nrx::nrxctl;

constexpr int misuse_status = 2;

outcome help(const option_words& words);

outcome version(const option_words& /*words*/) {
    print_line("nrxctl " NRXCTL_VERSION);
    return outcome::done;
}

struct option_row {
    const char* name;
    bool takes_argument;
    const char* words;
    const char* purpose;
    outcome (*run)(const option_words& words);
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
               "call the HID driver and dump its reply", ask_hid_driver},
    option_row{"mca", true, "on|off", "switch the MCA", turn_mca},
    option_row{"spi-status", true, "SERVICE MODE",
               "print the SPI status records of a HID device until an interrupt", watch_spi},
    option_row{"events", false, "[SECONDS]", "print HID events, for so long or until an interrupt",
               watch_events},
    option_row{"help", false, "", "print this help", help},
    option_row{"version", false, "", "print the version", version},
};

outcome help(const option_words& /*words*/) {
    constexpr std::size_t usage_width = 50;
    print_line("usage: nrxctl OPTION...");
    for (const option_row& row : option_rows) {
        text_line usage;
        usage.text("--").text(row.name).text(" ").text(row.words);
        print_line(text_line()
                       .text("  ")
                       .left(usage.view(), usage_width)
                       .text(" ")
                       .text(row.purpose)
                       .view());
    }
    print_line("Options are carried out in order. A SERVICE is a registry name or a service id;");
    print_line("VALUEs are hexadecimal, or decimal after 0d; all other numbers are decimal, or");
    print_line("hexadecimal after 0x.");
    return outcome::done;
}

int refuse(std::string_view problem, std::string_view word) {
    text_line lines;
    lines.text("nrxctl: ").text(problem).text(" ").text(word).text("\n");
    write_error(lines.text("Try nrxctl --help.\n").view());
    return misuse_status;
}

// What the parser takes: a row's number is the value of its option.
std::array<option, option_rows.size() + 1> parser_options() {
    std::array<option, option_rows.size() + 1> options{};
    for (std::size_t i = 0; i < option_rows.size(); ++i) {
        const option_row& row = option_rows[i];
        options[i] = {row.name, row.takes_argument ? required_argument : no_argument, nullptr,
                      static_cast<int>(i)};
    }
    return options;
}

// Carries the options out in order; the exit status.
int run(int argc, char** argv) {
    const std::span<char* const> words(argv, static_cast<std::size_t>(argc));
    const auto options = parser_options();
    int status = EXIT_SUCCESS;
    bool has_options = false;
    while (true) {
        const char* word = optind < argc ? argv[optind] : "";
        const int parsed = getopt_long(argc, argv, "+:", options.data(), nullptr);
        if (parsed == -1) break;
        if (parsed == ':') return refuse("a word is missing after", word);
        if (parsed == '?') return refuse("unknown option", word);
        has_options = true;
        const option_row& row = option_rows[static_cast<std::size_t>(parsed)];
        const option_words further{optarg == nullptr ? "" : optarg, words, optind};
        switch (row.run(further)) {
            case outcome::done:
                break;
            case outcome::failed:
                status = EXIT_FAILURE;
                break;
            case outcome::misused:
                return refuse("a word is missing after", std::string("--") + row.name);
        }
    }
    if (optind < argc) return refuse("unknown word", argv[optind]);
    return has_options ? status : refuse("an option is", "needed");
}

}  // namespace

int main(int argc, char** argv) {
    survive_closed_pipes();
    tick_period = platform::tick_period();
    return run(argc, argv);
}
