// The statistics of the coprocessor, which grow over time.
#pragma once

#include <cstdint>
#include <vector>

#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

class profiler_statistics {
public:
    // The clock must outlive the statistics.
    explicit profiler_statistics(const machine_clock& clock) : clock_(clock) {}

    // Resets the counts of the event sources.
    void clear_event_sources() { cleared_ = clock_.now(); }

    // Rows of 64 bytes: thread name, 36 bytes; event source, function, context, count, total time,
    // maximum time and maximum latency in microseconds, 32 bits each.
    [[nodiscard]] std::vector<std::uint8_t> event_sources() const;

    // A 32-bit count of wake requests for every wake reason.
    [[nodiscard]] std::vector<std::uint8_t> wake_requests() const;

private:
    const machine_clock& clock_;
    machine_clock::time cleared_{0};
};

}  // namespace platform::simulated
