// The 48-byte event records that the virtual profiler produces.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "platform/bytes.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

inline constexpr std::size_t event_record_size = 48;
using event_record = std::array<std::uint8_t, event_record_size>;

// One kind of event: when it is produced, and what its records hold. Bodies vary with turn, the
// number of the event.
struct event_kind {
    // For the component number: whichever component is enabled.
    static constexpr std::uint32_t any_component = 0xffffffff;

    std::uint32_t category;
    std::uint32_t component;
    std::uint32_t reports;  // produced if one of these bits is in the component's report mask
    std::uint8_t event;
    std::uint8_t type;
    void (*fill)(byte_span record, std::uint64_t turn);
};

// Every kind of event that there is.
extern const std::span<const event_kind> event_kinds;

// The records of one event, at a time of the coprocessor's: mostly one, but a bus transfer is
// followed by its data. Sequence numbers are taken from sequence_num, which goes up.
std::vector<event_record> make_event(const event_kind& kind, std::uint32_t component,
                                     std::uint64_t turn, machine_clock::time at,
                                     std::uint32_t& sequence_num);

// A note of the profiler about itself, as its logs keep them: what happened, and a number with it.
enum class control_event : std::uint8_t {
    started,     // log opened; number: records kept
    configured,  // number: configuration records
    enabled,
    disabled,
    stopped,
    flushed,
    duration_set,  // number: microseconds
    dumped,        // number: records in the error dump
};
event_record make_control_record(control_event what, std::uint32_t number, machine_clock::time at,
                                 std::uint32_t& sequence_num);

}  // namespace platform::simulated
