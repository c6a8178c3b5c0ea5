// The subcommands of the profiler command family. Each takes its own words and reports its own
// failures.
#pragma once

#include "nrxctl/base/argument_words.h"

namespace nrx::profile {

// Statistics.
void clear_event_source_statistics(argument_words& words);
void show_event_sources(argument_words& words);
void show_wake_requests(argument_words& words);

// State and configuration.
void enable(argument_words& words);
void disable(argument_words& words);
void stop(argument_words& words);
void flush(argument_words& words);
void configure(argument_words& words);
void show_configs(argument_words& words);

// Logs and errors.
void signal_error_dump(argument_words& words);
void show_logs(argument_words& words);
void set_action_on_error(argument_words& words);

// Monitoring.
void monitor(argument_words& words);
void run_profile(argument_words& words);

}  // namespace nrx::profile
