// A queue in memory that a driver shares with the tool.
#pragma once

#include <cstdint>
#include <deque>
#include <optional>
#include <utility>
#include <vector>

#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

// Holds entries in order. A driver that adds them as time goes by derives from it; it is asked to
// catch up whenever the tool looks at the queue.
class shared_queue {
public:
    using entry = std::vector<std::uint8_t>;

    shared_queue() = default;
    shared_queue(const shared_queue&) = delete;
    shared_queue& operator=(const shared_queue&) = delete;
    shared_queue(shared_queue&&) = delete;
    shared_queue& operator=(shared_queue&&) = delete;
    virtual ~shared_queue() = default;

    // Adds what is due by now.
    virtual void catch_up() {}

    // When the next entry is due if nobody intervenes; none: never.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const {
        return std::nullopt;
    }

    // The tool has let go of the memory.
    virtual void unmapped() {}

    void add(entry added) { entries_.push_back(std::move(added)); }
    [[nodiscard]] bool empty() const { return entries_.empty(); }
    [[nodiscard]] std::size_t size() const { return entries_.size(); }
    [[nodiscard]] const entry& first() const { return entries_.front(); }
    void drop_first() { entries_.pop_front(); }
    void clear() { entries_.clear(); }

private:
    std::deque<entry> entries_;
};

}  // namespace platform::simulated
