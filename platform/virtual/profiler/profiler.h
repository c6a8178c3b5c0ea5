// The virtual profiler: what its two halves, the kernel's driver and the coprocessor, share.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>

#include "platform/return_code.h"
#include "platform/virtual/interface_driver.h"
#include "platform/virtual/machine.h"
#include "platform/virtual/profiler/event_stream.h"
#include "platform/virtual/profiler/profiler_half.h"
#include "platform/virtual/profiler/profiler_statistics.h"
#include "platform/virtual/profiler/record_log.h"

namespace platform::simulated {

// Each half keeps its own configuration and its own log; a component that either half has enabled
// produces events. What is done to a half is noted in its log.
class profiler {
public:
    // The clock outlives the profiler.
    explicit profiler(const machine_clock& clock);

    [[nodiscard]] const std::shared_ptr<event_stream>& stream() const { return stream_; }
    [[nodiscard]] profiler_statistics& statistics() { return statistics_; }

    // --- the kernel's half ---

    void set_enabled(bool enabled);
    return_code configure_kernel(byte_view records);
    [[nodiscard]] byte_list kernel_configs(std::size_t room) const;

    // Copies the last records of the stream into the error dump.
    void dump_errors();

    // The oldest records, which are taken out.
    byte_list take_kernel_log(std::size_t room) { return kernel_log_.take(room); }
    byte_list take_error_dump(std::size_t room) { return error_dump_.take(room); }

    // Ends the stream.
    void stop_stream() { stream_->end(); }

    // --- the coprocessor's half ---

    return_code configure_coprocessor(byte_view records);
    [[nodiscard]] byte_list coprocessor_configs(std::size_t room) const;
    byte_list take_coprocessor_log(std::size_t room) { return coprocessor_log_.take(room); }

    // Disables all that the coprocessor profiles.
    void stop_coprocessor();

    // Hands over what has happened at once.
    void flush();

    // Ends the stream after a time from now; 0: it has no end.
    void set_duration(std::chrono::microseconds duration);

private:
    void note(record_log& log, control_event what, std::uint32_t number = 0);
    return_code configure(profiler_half& half, record_log& log, byte_view records);
    void update_sources();

    const machine_clock& clock_;
    std::shared_ptr<event_stream> stream_;
    profiler_statistics statistics_;
    profiler_half kernel_{kernel_abilities};
    profiler_half coprocessor_{coprocessor_abilities};
    record_log kernel_log_;
    record_log coprocessor_log_;
    record_log error_dump_;
};

// Registers the kernel's driver of a new profiler.
std::shared_ptr<profiler> add_profiler_driver(machine& host);

// Lets the interface service "profile" answer for the coprocessor's half.
void serve_profile(interface_driver& service, const std::shared_ptr<profiler>& shared);

}  // namespace platform::simulated
