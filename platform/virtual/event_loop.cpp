#include "platform/virtual/event_loop.h"

#include <utility>

#include "platform/virtual/interrupts.h"
#include "platform/virtual/return_codes.h"

namespace platform::simulated {

void event_loop::schedule(handle_id owner, const std::shared_ptr<loop_source>& source) {
    scheduled_.push_back({owner, source});
}

void event_loop::unschedule(handle_id owner) {
    std::erase_if(scheduled_, [&](const scheduled_source& one) { return one.owner == owner; });
}

// Of those that are due at the same time, the one that was scheduled first.
std::optional<event_loop::due_source> event_loop::next_source() const {
    std::optional<due_source> next;
    for (const scheduled_source& one : scheduled_) {
        const auto due = one.source->next_due();
        if (due && (!next || *due < next->at)) next = due_source{*due, one.source};
    }
    return next;
}

// What is due calls back even if the run is late. What comes about after the end of the run does
// not, so that a stream that never pauses cannot keep it going.
return_code event_loop::run(machine_clock& clock, std::optional<machine_clock::time> until) {
    while (true) {
        serve_interrupt();
        if (std::exchange(stop_asked_, false)) return success;
        const auto next = next_source();
        const bool in_time = next && (!until || next->at <= *until);
        const machine_clock::time now = clock.now();
        if (in_time && next->at <= now) {
            next->source->call_back();
        } else if (until && *until <= now) {
            return success;
        } else if (!clock.pass(in_time ? std::optional(next->at) : until)) {
            return endless_wait;
        }
    }
}

}  // namespace platform::simulated
