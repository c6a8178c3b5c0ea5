// Configurations as text.
#pragma once

#include "nrxctl/profiler/profiler_config.h"

namespace nrx {

// Prints a configuration as a line on standard output. Profilers and components are named as the
// decoders of their events name them.
void print_profiler_config(const profiler_config& config);

}  // namespace nrx
