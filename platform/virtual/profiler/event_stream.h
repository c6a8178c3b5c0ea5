// The queue through which the events of the virtual profiler reach the tool.
#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <optional>
#include <vector>

#include "platform/virtual/profiler/event_record.h"
#include "platform/virtual/profiler/profiler_config.h"
#include "platform/virtual/shared_queue.h"

namespace platform::simulated {

// While the stream is enabled and has sources, events occur at a constant rate. The sources take
// turns, and so do the kinds of events of each source. The coprocessor delivers events in batches.
// A full queue drops events, which leaves gaps in the sequence numbers.
class event_stream final : public shared_queue {
public:
    static constexpr std::size_t capacity = 16'384;  // entries
    static constexpr std::chrono::milliseconds batch_interval{20};

    // The clock must outlive the stream.
    explicit event_stream(const machine_clock& clock) : clock_(clock) {}

    // Sets the number of events per second, of all sources together; must be positive.
    void set_rate(std::uint32_t events_per_second);

    // Sets the sources of events: the enabled components.
    void set_sources(const std::vector<component_config>& components);

    void set_enabled(bool enabled);
    [[nodiscard]] bool enabled() const { return enabled_; }

    // Delivers the events that have occurred so far without waiting for the end of the batch.
    void flush();

    // Ends the stream: delivers the events that have occurred so far, then the end marker. Nothing
    // follows until the tool has unmapped the queue. Does nothing if the stream has ended already.
    void end();

    // Ends the stream after the given duration; 0 cancels a previous request.
    void end_after(std::chrono::microseconds duration);

    // The next sequence number, which the stream shares with the logs of the profiler.
    [[nodiscard]] std::uint32_t& sequence_num() { return sequence_num_; }

    // The most recent records, oldest first.
    [[nodiscard]] const std::deque<event_record>& recent() const { return recent_; }

    void catch_up() override;
    [[nodiscard]] std::optional<machine_clock::time> next_due() const override;
    void on_unmapped() override;

private:
    struct source {
        std::uint32_t component;
        std::vector<const event_kind*> kinds;
    };

    [[nodiscard]] bool running() const { return enabled_ && !ended_ && !sources_.empty(); }
    [[nodiscard]] machine_clock::time time_of(std::uint64_t event) const;
    void add_end_marker();
    void restart();
    void emit_until(machine_clock::time limit);
    void skip_dropped_events(machine_clock::time limit);
    void emit(std::uint64_t event);

    const machine_clock& clock_;
    machine_clock::time period_ = std::chrono::milliseconds(10);
    std::vector<source> sources_;
    bool enabled_ = false;
    bool ended_ = false;
    machine_clock::time start_{0};   // event n occurs n + 1 periods later
    std::uint64_t event_count_ = 0;  // events emitted since start_
    std::optional<machine_clock::time> end_time_;
    std::uint32_t sequence_num_ = 1;
    std::deque<event_record> recent_;
};

}  // namespace platform::simulated
