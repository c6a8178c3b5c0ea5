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

bool machine_clock::pass(std::optional<time> until) {
    if (!follows_host_) return pass_manually(until);
    await_interrupt(until ? std::optional(*until - host_now()) : std::nullopt);
    return true;
}

bool machine_clock::pass_manually(std::optional<time> until) {
    const auto next = std::min_element(
        planned_.begin(), planned_.end(),
        [](const planned_action& a, const planned_action& b) { return a.at < b.at; });
    if (next != planned_.end() && (!until || next->at <= *until)) {
        const planned_action due = std::move(*next);
        planned_.erase(next);
        manual_now_ = std::max(manual_now_, due.at);
        due.run();
        return true;
    }
    if (until) manual_now_ = std::max(manual_now_, *until);
    return until.has_value();
}

}  // namespace platform::simulated
