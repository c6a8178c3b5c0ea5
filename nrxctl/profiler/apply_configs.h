// Configures both halves of the profiler.
#pragma once

#include <span>

#include "nrxctl/profiler/profiler_config.h"

namespace nrx {

// Sends configurations to the coprocessor, if it has a profiler, and to the kernel's driver. If a
// half does not support one of them, or the driver is missing, a line on standard output says so
// and the configurations count as applied. Returns false with a failure report if a half refuses
// them for any other reason.
bool apply_profiler_configs(std::span<const profiler_config> configs);

}  // namespace nrx
