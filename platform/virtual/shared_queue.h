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

// Holds entries in order. A driver that produces entries over time derives from it; catch_up is
// called whenever the tool looks at the queue.
class shared_queue {
public:
    shared_queue() = default;
    shared_queue(const shared_queue&) = delete;
    shared_queue& operator=(const shared_queue&) = delete;
    shared_queue(shared_queue&&) = delete;
    shared_queue& operator=(shared_queue&&) = delete;
    virtual ~shared_queue() = default;

    // Adds the entries that are due by now.
    virtual void catch_up() {}

    // Time of the next entry; nullopt if there is none.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const {
        return std::nullopt;
    }

    // Called when the tool has unmapped the memory.
    virtual void on_unmapped() {}

    void add(byte_view entry) {
        // Reclaim the space of removed entries once they take up more than half of the buffer.
        if (begin_ > bytes_.size() / 2) {
            bytes_.erase(bytes_.begin(), bytes_.begin() + static_cast<std::ptrdiff_t>(begin_));
            begin_ = 0;
        }
        bytes_.insert(bytes_.end(), entry.begin(), entry.end());
        sizes_.push_back(entry.size());
    }
    void add(std::initializer_list<std::uint8_t> entry) {
        add(byte_view(entry.begin(), entry.size()));
    }

    [[nodiscard]] bool empty() const { return sizes_.empty(); }
    [[nodiscard]] std::size_t size() const { return sizes_.size(); }

    // The first entry; valid until the queue changes. The queue must not be empty.
    [[nodiscard]] byte_view front() const {
        return byte_view(bytes_).subspan(begin_, sizes_.front());
    }
    void pop_front() {
        begin_ += sizes_.front();
        sizes_.pop_front();
    }

    void clear() {
        bytes_.clear();
        begin_ = 0;
        sizes_.clear();
    }

private:
    // The entries are stored back to back, the first one at begin_.
    std::vector<std::uint8_t> bytes_;
    std::size_t begin_ = 0;
    std::deque<std::size_t> sizes_;
};

}  // namespace platform::simulated
