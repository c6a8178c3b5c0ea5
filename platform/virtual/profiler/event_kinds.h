// The kinds of events that the virtual profiler produces.
#pragma once

#include <cstdint>
#include <span>

#include "platform/bytes.h"

namespace platform::simulated {

// A kind of event: when it is produced, and what its records contain. The bodies vary with the
// number of the event.
struct event_kind {
    // A component number that stands for every component of the category.
    static constexpr std::uint32_t any_component = 0xffffffff;

    std::uint32_t category;
    std::uint32_t component;
    std::uint32_t reports;  // produced if the component's report mask has one of these bits
    std::uint8_t event;
    std::uint8_t type;
    void (*fill)(byte_span record, std::uint64_t number);
};

// All kinds of events.
extern const std::span<const event_kind> event_kinds;

}  // namespace platform::simulated
