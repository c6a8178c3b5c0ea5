// A log of event records that is emptied by reading it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <vector>

#include "platform/virtual/profiler/event_record.h"

namespace platform::simulated {

// Keeps the newest records.
class record_log {
public:
    static constexpr std::size_t capacity = 1'024;

    void add(const event_record& record);

    // The oldest records, as many whole ones as room has space for; they leave the log.
    std::vector<std::uint8_t> take(std::size_t room);

private:
    std::deque<event_record> records_;
};

}  // namespace platform::simulated
