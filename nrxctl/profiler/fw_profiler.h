// The coprocessor's half of the profiler, the interface service "profile".
//
// Unless said otherwise, an operation reports its own failures and returns the platform's code, as
// the operations of the command channel do.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "nrxctl/profiler/profiler_config.h"
#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Returns true if the coprocessor has a profiler.
bool fw_profiler_available();

// Sends configurations. Succeeds and sends nothing if there is no profiler. A command that fails is
// not reported.
platform::return_code send_fw_configs(std::span<const profiler_config> configs);

// Returns the active configurations; none, without a failure report, if they cannot be read.
std::vector<profiler_config> read_fw_configs();

// Sets the duration of a monitor in microseconds; 0 is without end.
platform::return_code set_monitor_duration(std::uint32_t microseconds);

enum class error_action : std::uint32_t { nothing, panic };

// Sets what the coprocessor does on an error.
platform::return_code set_error_action(error_action action);

// Resets the statistics of all event sources.
platform::return_code clear_event_sources();

// Read statistics into the buffer that rows (counts) refers to, which is shrunk to the bytes
// returned: rows of 64 bytes, and 32-bit counts.
platform::return_code read_event_sources(platform::byte_span& rows);
platform::return_code read_wake_requests(platform::byte_span& counts);

// Stops all profilers of the coprocessor. The driver's half is unchanged.
platform::return_code stop_fw_profiler();

// Has the coprocessor deliver the events that it has recorded at once.
platform::return_code flush_fw_profiler();

}  // namespace nrx
