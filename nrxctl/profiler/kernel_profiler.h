// What is asked of the kernel's half of the profiler. Unless said otherwise, an operation uses a
// connection of its own and reports its own failures; a missing driver is one.
#pragma once

#include <cstdint>
#include <vector>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/profiler/profiler_config.h"
#include "nrxctl/profiler/profiler_conn.h"

namespace nrx {

// Enables or disables the profiler. Whether the driver did.
bool set_profiler_enabled(bool enable);

// Asks whether a client is connected, into connected. Whether the driver told; if not, connected is
// as it was.
bool get_profiler_status(bool& connected);

// The active configurations, read on an open connection; none if they cannot be read.
std::vector<profiler_config> read_kernel_configs(const profiler_conn& conn);

// What the driver has stored, by the method that reads it.
enum class stored_records : std::uint32_t {
    error_dump = profiler_method::read_error_dump,
    log = profiler_method::read_log,
};

// Hands every whole event record that the driver has stored to print: up to ten reads, until one
// brings less than a record or fails. Without a driver, does nothing.
void read_profiler_log(record_printer print, stored_records which = stored_records::log);

// Asks the driver to make an error dump. Without a driver, does nothing.
void make_error_dump();

// Handles the interrupt signal while a command of the profiler family runs: asks the driver to end
// the stream of events, on which a monitor ends. The command goes on.
void stop_on_interrupt();

}  // namespace nrx
