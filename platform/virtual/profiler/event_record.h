// The 48-byte event records that the virtual profiler produces.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <vector>

#include "platform/bytes.h"
#include "platform/virtual/machine_clock.h"
#include "platform/virtual/profiler/event_kinds.h"

namespace platform::simulated {

inline constexpr std::size_t event_record_size = 48;
using event_record = std::array<std::uint8_t, event_record_size>;

// Creates the records of an event: usually one, but a bus transfer is followed by its data. time is
// the coprocessor's. Each record takes a sequence number and increments it.
std::vector<event_record> make_event(const event_kind& kind, std::uint32_t component,
                                     std::uint64_t number, machine_clock::time time,
                                     std::uint32_t& sequence_num);

// What the profiler records about itself in its logs, and the argument of each such record.
enum class control_event : std::uint8_t {
    started,
    configured,  // number of configuration records
    enabled,
    disabled,
    stopped,
    flushed,
    duration_set,  // microseconds
    dumped,        // number of records in the error dump
};

event_record make_control_record(control_event event, std::uint32_t argument,
                                 machine_clock::time time, std::uint32_t& sequence_num);

// A log of event records. Keeps the newest ones; reading removes records.
class record_log {
public:
    static constexpr std::size_t capacity = 1'024;

    void add(const event_record& record);

    // Removes and returns the oldest records, as many as fit into max_bytes.
    std::vector<std::uint8_t> read(std::size_t max_bytes);

private:
    std::deque<event_record> records_;
};

}  // namespace platform::simulated
