// The subcommands of the replay command family. Each takes its own words and reports its own
// failures.
#pragma once

#include "nrxctl/base/argument_words.h"

namespace nrx::replay {

// Samples.
void load(argument_words& words);
void unload(argument_words& words);

// State.
void enable(argument_words& words);
void disable(argument_words& words);
void schedule_enable(argument_words& words);
void show_status(argument_words& words);

// Whether replay is enabled; if not, says so in a line on standard output.
bool replay_is_enabled();

}  // namespace nrx::replay
