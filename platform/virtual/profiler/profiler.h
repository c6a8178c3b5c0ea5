// The virtual profiler. It has two halves: the kernel's driver and the coprocessor.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>

#include "platform/return_code.h"
#include "platform/virtual/interface_driver.h"
#include "platform/virtual/machine.h"
#include "platform/virtual/profiler/event_record.h"
#include "platform/virtual/profiler/event_stream.h"
#include "platform/virtual/profiler/profiler_config.h"
#include "platform/virtual/profiler/profiler_statistics.h"

namespace platform::simulated {

// Each half has a configuration of its own and logs the operations on it. A component produces
// events if either half has enabled it.
class profiler {
public:
    // The clock must outlive the profiler.
    explicit profiler(const machine_clock& clock);

    [[nodiscard]] const std::shared_ptr<event_stream>& stream() const { return stream_; }
    [[nodiscard]] profiler_statistics& statistics() { return statistics_; }

    // --- the kernel's half ---

    void set_enabled(bool enabled);
    return_code configure_kernel(byte_view records);
    [[nodiscard]] byte_list kernel_configs(std::size_t capacity) const;

    // Copies the most recent records of the stream to the error dump.
    void dump_errors();

    // Remove and return the oldest records.
    byte_list read_kernel_log(std::size_t capacity) { return kernel_log_.read(capacity); }
    byte_list read_error_dump(std::size_t capacity) { return error_dump_.read(capacity); }

    // Ends the stream.
    void stop_stream() { stream_->end(); }

    // --- the coprocessor's half ---

    return_code configure_coprocessor(byte_view records);
    [[nodiscard]] byte_list coprocessor_configs(std::size_t capacity) const;
    byte_list read_coprocessor_log(std::size_t capacity) { return coprocessor_log_.read(capacity); }

    // Disables all components of the coprocessor.
    void stop_coprocessor();

    // Delivers the events that have occurred so far.
    void flush();

    // Ends the stream after the given duration; 0 means no end.
    void set_duration(std::chrono::microseconds duration);

private:
    void log_event(record_log& log, control_event event, std::uint32_t argument = 0);
    return_code configure(profiler_half& half, record_log& log, byte_view records);
    void update_sources();

    const machine_clock& clock_;
    std::shared_ptr<event_stream> stream_;
    profiler_statistics statistics_;
    profiler_half kernel_{kernel_capabilities};
    profiler_half coprocessor_{coprocessor_capabilities};
    record_log kernel_log_;
    record_log coprocessor_log_;
    record_log error_dump_;
};

// Creates a profiler and registers the driver of its kernel half.
std::shared_ptr<profiler> add_profiler_driver(machine& host);

// Adds the reports and commands of the coprocessor's half to the interface service "profile".
void serve_profile(interface_driver& service, const std::shared_ptr<profiler>& shared);

}  // namespace platform::simulated
