#include <array>
#include <optional>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/profile_record.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

namespace {

// The arguments of "get-logs".
struct log_options {
    bool firmware = false;
    bool errors = false;
    bool human = false;
};

struct log_option_row {
    std::string_view keyword;
    bool log_options::*option;
};

constexpr std::array log_option_rows{
    log_option_row{"errdump", &log_options::errors},
    log_option_row{"fwdump", &log_options::firmware},
    log_option_row{"human", &log_options::human},
};

// Returns nullopt if an argument is unknown.
std::optional<log_options> parse_log_options(argument_cursor& arguments) {
    log_options options;
    while (const auto argument = arguments.next()) {
        const log_option_row* row = find_keyword(log_option_rows, *argument);
        if (row == nullptr) return std::nullopt;
        options.*(row->option) = true;
    }
    return options;
}

struct error_action_row {
    std::string_view keyword;
    error_action action;
};

constexpr std::array error_action_rows{
    error_action_row{"panic", error_action::panic},
    error_action_row{"nothing", error_action::nothing},
};

}  // namespace

void signal_error_dump(argument_cursor& /*arguments*/) {
    make_error_dump();
}

void show_logs(argument_cursor& arguments) {
    const auto options = parse_log_options(arguments);
    if (!options) {
        print_line("Invalid parameter");
        check(false, "false");
        return;
    }
    const record_printer print = select_record_printer(options->human);
    if (options->firmware || !options->errors) {
        read_profile_records(print);
        read_profiler_log(print);
        print_line("\n");
    }
    if (options->errors) {
        print_line("errdump");
        read_profiler_log(print, record_store::error_dump);
        print_line("\n");
    }
}

// A missing argument is invalid, too.
void set_action_on_error(argument_cursor& arguments) {
    const std::string_view argument = arguments.next().value_or("");
    const error_action_row* row = find_keyword(error_action_rows, argument);
    if (row == nullptr) {
        print_line(text_line().text("invalid argument: ").text(argument).view());
        return;
    }
    const platform::return_code kr = set_error_action(row->action);
    check_success(kr, condition::kr_is_zero);
}

}  // namespace nrx::profile
