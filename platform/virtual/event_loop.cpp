#include "platform/virtual/event_loop.h"

#include <utility>

#include "platform/virtual/interrupts.h"
#include "platform/virtual/return_codes.h"

namespace platform::simulated {

void event_loop::schedule(handle_id owner, const std::shared_ptr<loop_source>& source) {
    scheduled_.push_back({owner, source});
}

void event_loop::unschedule(handle_id owner) {
    std::erase_if(scheduled_,
                  [&](const scheduled_source& scheduled) { return scheduled.owner == owner; });
}

// Among sources that are due at the same time, the one scheduled first wins.
std::optional<event_loop::due_source> event_loop::next_source() const {
    std::optional<due_source> next;
    for (const scheduled_source& scheduled : scheduled_) {
        const auto due = scheduled.source->next_due();
        if (due && (!next || *due < next->time)) next = due_source{*due, scheduled.source};
    }
    return next;
}

// Callbacks due before the deadline are made even if the run is late. Later ones are not, so that a
// stream without pauses cannot prolong the run.
return_code event_loop::run(machine_clock& clock, std::optional<machine_clock::time> deadline) {
    while (true) {
        serve_interrupt();
        if (std::exchange(stop_requested_, false)) return success;
        const auto next = next_source();
        const bool in_time = next && (!deadline || next->time <= *deadline);
        const machine_clock::time now = clock.now();
        if (in_time && next->time <= now) {
            next->source->call_back();
        } else if (deadline && *deadline <= now) {
            return success;
        } else if (!clock.advance(in_time ? std::optional(next->time) : deadline)) {
            return deadlock;
        }
    }
}

}  // namespace platform::simulated
