// The subcommands of the profiler command family. Each reads its own arguments and reports its own
// failures. A check reads the same arguments with the same messages, and does nothing else.
#pragma once

#include "nrxctl/base/arguments.h"

namespace nrx::profile {

// control_subcommands.cpp
void enable(argument_cursor& arguments);
void disable(argument_cursor& arguments);
void stop(argument_cursor& arguments);
void flush(argument_cursor& arguments);
void set_action_on_error(argument_cursor& arguments);
void configure(argument_cursor& arguments);
void show_configs(argument_cursor& arguments);
void monitor(argument_cursor& arguments);

// A complete profiling run: configures, enables, monitors, and disables again.
void run_profile(argument_cursor& arguments);

arguments_check check_error_action(argument_cursor& arguments);
arguments_check check_configs(argument_cursor& arguments);
arguments_check check_monitor(argument_cursor& arguments);
arguments_check check_run(argument_cursor& arguments);

// log_subcommands.cpp
void signal_error_dump(argument_cursor& arguments);
void show_logs(argument_cursor& arguments);
arguments_check check_log_options(argument_cursor& arguments);

// statistics_subcommands.cpp
void clear_event_source_statistics(argument_cursor& arguments);
void show_event_sources(argument_cursor& arguments);
void show_wake_requests(argument_cursor& arguments);

}  // namespace nrx::profile
