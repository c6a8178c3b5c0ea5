// Configuring both halves of the profiler.
#pragma once

#include <span>

#include "nrxctl/profiler/profiler_config.h"

namespace nrx {

// Sends the configurations to the coprocessor, if it has a profiler, and to the kernel's driver. A
// half that does not support one of them says so in a line on standard output, as does a missing
// driver, and the configurations count as applied. False, with a failure report, for any other
// refusal.
bool apply_profiler_configs(std::span<const profiler_config> configs);

}  // namespace nrx
