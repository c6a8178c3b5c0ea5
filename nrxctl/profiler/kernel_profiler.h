// The kernel's half of the profiler: the connection to its driver and the operations on it.
//
// Unless said otherwise, an operation opens a connection of its own and reports its own failures,
// including a missing driver.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/profiler/profiler_config.h"
#include "platform/data_queue.h"
#include "platform/return_code.h"

namespace nrx {

// The driver's methods.
namespace profiler_method {

inline constexpr std::uint32_t set_enabled = 0;       // scalar in: 1 enable, 0 disable
inline constexpr std::uint32_t read_status = 1;       // scalar out: not 0 if a client is connected
inline constexpr std::uint32_t configure = 2;         // structure in: configuration records
inline constexpr std::uint32_t read_configs = 3;      // structure out: configuration records
inline constexpr std::uint32_t read_error_dump = 8;   // structure out: event records
inline constexpr std::uint32_t read_log = 9;          // structure out: event records
inline constexpr std::uint32_t make_error_dump = 10;  // nothing in or out
inline constexpr std::uint32_t stop_monitor = 11;     // nothing in or out

}  // namespace profiler_method

// A connection to the driver, opened on its service itself. Destruction unmaps the queue, releases
// the port, then closes the connection and releases the service.
class profiler_conn final : public service_conn {
public:
    profiler_conn() : service_conn("KeltoNRXProfileDriver") {}

    // Finds the driver by its registry name and opens a connection of type 0 on it. Returns true on
    // success; otherwise the failed check is reported, except that a missing driver is reported or
    // not as on_missing says.
    bool open(on_failure on_missing = on_failure::report);

    // Opens the connection, maps the driver's event queue and attaches a port that the driver
    // signals when events arrive. Returns true on success; otherwise the failed check is reported,
    // except that a mapping that fails or returns no memory is reported or not as on_unmapped says.
    bool open_queue(on_failure on_unmapped = on_failure::report);

    // Both are empty before a successful open_queue.
    [[nodiscard]] const platform::mapped_memory& queue() const { return queue_; }
    [[nodiscard]] const platform::notification_port& port() const { return port_; }

private:
    // Members are released from the last to the first.
    platform::notification_port port_;
    platform::mapped_memory queue_;
};

// Enables or disables the profiler. Returns true on success.
bool set_profiler_enabled(bool enable);

// Stores whether a client is connected in connected. Returns false and leaves connected unchanged
// on failure.
bool get_profiler_status(bool& connected);

// Sends configurations. Returns the driver's code, which is not reported, or nullopt if there is no
// connection.
std::optional<platform::return_code> send_kernel_configs(std::span<const profiler_config> configs);

// Returns the active configurations, read on an open connection; none, without a failure report, if
// they cannot be read.
std::vector<profiler_config> read_kernel_configs(const profiler_conn& conn);

// The driver's stores of event records, by the method that reads them.
enum class record_store : std::uint32_t {
    error_dump = profiler_method::read_error_dump,
    log = profiler_method::read_log,
};

// Passes each complete record in a store to print: up to ten reads, until one returns less than a
// record or fails. Does nothing without a driver.
void read_profiler_log(record_printer print, record_store store = record_store::log);

// Has the driver make an error dump. Does nothing without a driver.
void make_error_dump();

// Asks the driver to end the stream of events, which ends a running monitor. Handles the interrupt
// signal while a profiler command runs; the command continues.
void stop_on_interrupt();

// Installs stop_on_interrupt for the lifetime of the object, then restores the default action,
// which ends the process.
class scoped_interrupt_handler {
public:
    scoped_interrupt_handler();
    ~scoped_interrupt_handler();
    scoped_interrupt_handler(const scoped_interrupt_handler&) = delete;
    scoped_interrupt_handler& operator=(const scoped_interrupt_handler&) = delete;
};

}  // namespace nrx
