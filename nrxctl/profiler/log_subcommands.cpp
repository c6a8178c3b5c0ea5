#include <array>
#include <optional>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/record_text.h"
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

// Returns nullopt with a failure report if an argument is unknown.
std::optional<log_options> parse_log_options(argument_cursor& arguments) {
    log_options options;
    while (const auto argument = arguments.next()) {
        const log_option_row* row = find_keyword(log_option_rows, *argument);
        if (row == nullptr) print_line("Invalid parameter");
        if (!check_explained(row, condition::never, [&] {
                return unknown_keyword("argument", *argument, "expected",
                                       keywords_of(log_option_rows));
            })) {
            return std::nullopt;
        }
        options.*(row->option) = true;
    }
    return options;
}

}  // namespace

void signal_error_dump(argument_cursor& /*arguments*/) {
    make_error_dump();
}

void show_logs(argument_cursor& arguments) {
    const auto options = parse_log_options(arguments);
    if (!options) return;
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

arguments_check check_log_options(argument_cursor& arguments) {
    return accepted_if(parse_log_options(arguments).has_value());
}

}  // namespace nrx::profile
