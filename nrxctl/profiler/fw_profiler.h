// What is asked of the coprocessor's half of the profiler, the interface service "profile". The
// operations that send or read report their own failures and return the platform's code, as those
// of the command channel do.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "nrxctl/profiler/profiler_config.h"
#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Whether the coprocessor has a profiler.
bool fw_profiler_available();

// Sends configurations. Success, and nothing sent, if there is no profiler; else the code of the
// command; a command that is refused is not reported.
platform::return_code send_fw_configs(std::span<const profiler_config> configs);

// The active configurations; none if they cannot be read.
std::vector<profiler_config> read_fw_configs();

// Tells how long the events are going to be monitored, in microseconds; 0: without end.
platform::return_code set_monitor_duration(std::uint32_t microseconds);

enum class error_action : std::uint32_t { nothing, panic };

// Sets what the coprocessor does on an error.
platform::return_code set_error_action(error_action action);

// Sets the statistics of all event sources back to nothing.
platform::return_code clear_event_sources();

// Reads statistics into the room that rows or counts gives, which is cut to what came back: rows as
// print_event_sources takes them, counts as print_wake_requests does.
platform::return_code read_event_sources(platform::byte_span& rows);
platform::return_code read_wake_requests(platform::byte_span& counts);

// Ends all that the coprocessor profiles, without touching the driver's half.
platform::return_code stop_fw_profiler();

// Has the coprocessor hand over at once the events that it has recorded.
platform::return_code flush_fw_profiler();

}  // namespace nrx
