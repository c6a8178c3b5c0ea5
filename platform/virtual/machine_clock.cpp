#include "platform/virtual/machine_clock.h"

#include <algorithm>

#include "platform/virtual/interrupts.h"

namespace platform::simulated {

namespace {

machine_clock::time host_now() {
    return std::chrono::steady_clock::now().time_since_epoch();
}

}  // namespace

machine_clock::time machine_clock::now() const {
    return follows_host_ ? host_now() : manual_now_;
}

machine_clock::time machine_clock::wall_at(time instant) const {
    if (!follows_host_) return wall_start_ + instant;
    const time wall_now = std::chrono::system_clock::now().time_since_epoch();
    return wall_now - (host_now() - instant);
}

bool machine_clock::advance(std::optional<time> deadline) {
    if (!follows_host_) return advance_manually(deadline);
    await_interrupt(deadline ? std::optional(*deadline - host_now()) : std::nullopt);
    return true;
}

bool machine_clock::advance_manually(std::optional<time> deadline) {
    const auto next = std::min_element(
        timed_actions_.begin(), timed_actions_.end(),
        [](const timed_action& a, const timed_action& b) { return a.due < b.due; });
    if (next != timed_actions_.end() && (!deadline || next->due <= *deadline)) {
        const timed_action due = std::move(*next);
        timed_actions_.erase(next);
        manual_now_ = std::max(manual_now_, due.due);
        due.run();
        return true;
    }
    if (deadline) manual_now_ = std::max(manual_now_, *deadline);
    return deadline.has_value();
}

}  // namespace platform::simulated
