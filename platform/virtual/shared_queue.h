// A queue in memory that a driver shares with the tool.
#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <initializer_list>
#include <optional>
#include <vector>

#include "platform/bytes.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

// Holds entries in order. A driver that adds them as time goes by derives from it; it is asked to
// catch up whenever the tool looks at the queue.
class shared_queue {
public:
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

    void add(byte_view entry);
    void add(std::initializer_list<std::uint8_t> entry) {
        add(byte_view(entry.begin(), entry.size()));
    }
    [[nodiscard]] bool empty() const { return sizes_.empty(); }
    [[nodiscard]] std::size_t size() const { return sizes_.size(); }

    // The first entry, until the next change of the queue; there must be one.
    [[nodiscard]] byte_view first() const {
        return byte_view(bytes_).subspan(first_, sizes_.front());
    }
    void drop_first();
    void clear();

private:
    // The entries stand one behind the other, the first at first_.
    std::vector<std::uint8_t> bytes_;
    std::size_t first_ = 0;
    std::deque<std::size_t> sizes_;
};

}  // namespace platform::simulated
