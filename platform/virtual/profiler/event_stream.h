// The queue through which the virtual profiler's events reach the tool.
#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <optional>
#include <vector>

#include "platform/virtual/profiler/component_config.h"
#include "platform/virtual/profiler/event_record.h"
#include "platform/virtual/shared_queue.h"

namespace platform::simulated {

// While it is enabled and has sources, events happen at an even rate, each source in turn and each
// of its kinds in turn. The coprocessor hands them over in batches. A full queue loses events; the
// sequence numbers tell.
class event_stream final : public shared_queue {
public:
    static constexpr std::size_t capacity = 16'384;  // entries
    static constexpr std::chrono::milliseconds batch_interval{20};

    // The clock outlives the stream.
    explicit event_stream(const machine_clock& clock) : clock_(clock) {}

    // Events per second, of all sources together; above 0.
    void set_rate(std::uint32_t events_per_second);

    // What events come from: enabled components.
    void set_sources(const std::vector<component_config>& components);

    void set_enabled(bool enabled);
    [[nodiscard]] bool enabled() const { return enabled_; }

    // Hands over what has happened so far, before the batch is due.
    void flush();

    // Ends the stream: hands over what has happened, then the end marker. Nothing follows it until
    // the tool has let go of the queue. A stream that has ended gets no second marker.
    void end();

    // Ends the stream after a time from now; 0 calls that off.
    void end_after(std::chrono::microseconds duration);

    // The next sequence number. The logs of the profiler draw theirs from here too.
    [[nodiscard]] std::uint32_t& sequence_num() { return sequence_num_; }

    // The last records that happened, oldest first.
    [[nodiscard]] const std::deque<event_record>& recent() const { return recent_; }

    void catch_up() override;
    [[nodiscard]] std::optional<machine_clock::time> next_due() const override;
    void unmapped() override;

private:
    struct source {
        std::uint32_t component;
        std::vector<const event_kind*> kinds;
    };

    [[nodiscard]] bool running() const { return enabled_ && !ended_ && !sources_.empty(); }
    [[nodiscard]] machine_clock::time time_of(std::uint64_t event) const;
    void mark_end();
    void restart();
    void happen_until(machine_clock::time horizon);
    void skip_what_would_be_lost(machine_clock::time horizon);
    void happen(std::uint64_t event);

    const machine_clock& clock_;
    machine_clock::time period_ = std::chrono::milliseconds(10);
    std::vector<source> sources_;
    bool enabled_ = false;
    bool ended_ = false;
    machine_clock::time start_{0};  // event n happens n + 1 periods after this
    std::uint64_t events_ = 0;      // since then
    std::optional<machine_clock::time> end_at_;
    std::uint32_t sequence_num_ = 1;
    std::deque<event_record> recent_;
};

}  // namespace platform::simulated
