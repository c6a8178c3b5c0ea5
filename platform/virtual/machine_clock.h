// The clock of a virtual host.
#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <utility>
#include <vector>

namespace platform::simulated {

// A manual clock at first: time stands still but for waits and sleeps, which let exactly the time
// pass that they would take, and take none. Or the clock of the host underneath.
class machine_clock {
public:
    // Time since the clock started.
    using time = std::chrono::nanoseconds;

    // From now on, and for good, the time is that of the host underneath.
    void follow_host() { follows_host_ = true; }

    [[nodiscard]] time now() const;

    // The same instant on the wall clock, as time since 1970, UTC. The manual clock started at the
    // time that was set for it.
    [[nodiscard]] time wall_at(time instant) const;
    void set_wall_start(time wall) { wall_start_ = wall; }

    // Lets time pass until the given time, or without end, but only up to the next planned action,
    // which is then carried out, or the next interrupt, which is not served. False if nothing can
    // ever end it, on the manual clock alone.
    bool pass(std::optional<time> until);

    // Carries out an action at a time of the manual clock.
    void plan(time at, std::function<void()> action) {
        planned_.push_back({at, std::move(action)});
    }

private:
    struct planned_action {
        time at;
        std::function<void()> run;
    };

    bool pass_manually(std::optional<time> until);

    bool follows_host_ = false;
    time manual_now_{0};
    time wall_start_{0};
    std::vector<planned_action> planned_;
};

}  // namespace platform::simulated
