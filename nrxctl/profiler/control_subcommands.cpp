#include <array>
#include <optional>
#include <string_view>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/config_parser.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/monitor.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

namespace {

void print_configs(std::span<const profiler_config> configs) {
    for (const profiler_config& config : configs)
        print_profiler_config(config);
}

void print_active_configs(std::span<const profiler_config> configs) {
    if (configs.empty()) print_line("    none");
    print_configs(configs);
}

struct error_action_row {
    std::string_view keyword;
    error_action action;
};

constexpr std::array error_action_rows{
    error_action_row{"panic", error_action::panic},
    error_action_row{"nothing", error_action::nothing},
};

// Reads the argument of "on-error". A missing one is invalid, too.
const error_action_row* read_error_action(argument_cursor& arguments) {
    const std::string_view argument = arguments.next().value_or("");
    const error_action_row* row = find_keyword(error_action_rows, argument);
    if (row != nullptr) return row;
    print_failure(text_line().text("invalid argument: ").text(argument).view());
    explain([&] {
        if (argument.empty()) return explanation{"on-error needs panic|nothing"};
        return unknown_keyword("action", argument, "expected", keywords_of(error_action_rows));
    });
    return nullptr;
}

bool read_configs(argument_cursor& arguments, std::vector<profiler_config>& configs) {
    const bool success = parse_profiler_configs(arguments, configs);
    return check(success, condition::success);
}

// The arguments of a profiling run.
struct run_args {
    monitor_args monitor;
    std::vector<profiler_config> configs;
};

std::optional<run_args> read_run_args(argument_cursor& arguments) {
    run_args args{parse_monitor_args(arguments), {}};
    const bool human_is_late = arguments.peek(0) == human_keyword;
    const explanation_scope scope([=](explanation& given) {
        if (human_is_late) given = {"human must come before the duration"};
    });
    return read_configs(arguments, args.configs) ? std::optional(args) : std::nullopt;
}

}  // namespace

void enable(argument_cursor& /*arguments*/) {
    set_profiler_enabled(true);
}

void disable(argument_cursor& /*arguments*/) {
    set_profiler_enabled(false);
}

void stop(argument_cursor& /*arguments*/) {
    if (fw_profiler_available()) stop_fw_profiler();
}

void flush(argument_cursor& /*arguments*/) {
    if (!fw_profiler_available()) return;
    const platform::return_code kr = flush_fw_profiler();
    check_success(kr, condition::kr_is_zero);
}

void set_action_on_error(argument_cursor& arguments) {
    const error_action_row* row = read_error_action(arguments);
    if (row == nullptr) return;
    const platform::return_code kr = set_error_action(row->action);
    check_success(kr, condition::kr_is_zero);
}

void configure(argument_cursor& arguments) {
    std::vector<profiler_config> configs;
    if (!read_configs(arguments, configs)) return;
    print_configs(configs);
    const bool success = apply_profiler_configs(configs);
    check(success, condition::success);
}

void show_configs(argument_cursor& /*arguments*/) {
    profiler_conn conn;
    bool success = conn.open();
    if (!check(success, condition::success)) return;
    bool connected = false;
    success = get_profiler_status(connected);
    if (!check(success, condition::success)) return;
    print_line(connected ? "A client is connected" : "No client is connected");
    print_line("\nActive components in kext:");
    print_active_configs(read_kernel_configs(conn));
    print_line("\nActive components in fw:");
    if (fw_profiler_available()) {
        print_active_configs(read_fw_configs());
    } else {
        print_line("    fw profiler is not available");
    }
}

void monitor(argument_cursor& arguments) {
    const monitor_args args = parse_monitor_args(arguments);
    monitor_profiler(args.duration, select_record_printer(args.human));
}

void run_profile(argument_cursor& arguments) {
    auto args = read_run_args(arguments);
    if (!args) return;
    bool success = apply_profiler_configs(args->configs);
    if (!check(success, condition::success)) return;
    success = set_profiler_enabled(true);
    if (!check(success, condition::success)) return;
    success = monitor_profiler(args->monitor.duration, select_record_printer(args->monitor.human));
    if (!check(success, condition::success)) return;
    for (profiler_config& config : args->configs)
        config.state = profiler_state::disable;
    apply_profiler_configs(args->configs);
    set_profiler_enabled(false);
}

arguments_check check_error_action(argument_cursor& arguments) {
    return accepted_if(read_error_action(arguments) != nullptr);
}

arguments_check check_configs(argument_cursor& arguments) {
    if (arguments.remaining() == 0) {
        explain([] { return explanation{"config needs CONFIG..., such as sensor:accel"}; });
        return arguments_check::usage_error;
    }
    std::vector<profiler_config> configs;
    return accepted_if(read_configs(arguments, configs));
}

arguments_check check_monitor(argument_cursor& arguments) {
    parse_monitor_args(arguments);
    return arguments_check::accepted;
}

arguments_check check_run(argument_cursor& arguments) {
    return accepted_if(read_run_args(arguments).has_value());
}

}  // namespace nrx::profile
