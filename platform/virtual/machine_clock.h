// The clock of a virtual host.
#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <utility>
#include <vector>

namespace platform::simulated {

// Initially a manual clock: only waits and sleeps advance it, by their exact duration and without
// blocking. It can be switched to the clock of the underlying host.
class machine_clock {
public:
    // Time since the clock started.
    using time = std::chrono::nanoseconds;

    // Switches permanently to the clock of the underlying host.
    void follow_host() { follows_host_ = true; }

    [[nodiscard]] time now() const;

    // Converts a time to wall-clock time since 1970, UTC.
    [[nodiscard]] time wall_at(time instant) const;

    // Sets the wall-clock time at which the manual clock started.
    void set_wall_start(time wall) { wall_start_ = wall; }

    // Waits until the deadline, or without limit. The wait ends early at the next timed action,
    // which is run, and at the next interrupt, which is left pending. Returns false if nothing can
    // end the wait, which only the manual clock knows.
    bool advance(std::optional<time> deadline);

    // Runs an action when the manual clock reaches the given time.
    void run_at(time due, std::function<void()> action) {
        timed_actions_.push_back({due, std::move(action)});
    }

private:
    struct timed_action {
        time due;
        std::function<void()> run;
    };

    bool advance_manually(std::optional<time> deadline);

    bool follows_host_ = false;
    time manual_now_{0};
    time wall_start_{0};
    std::vector<timed_action> timed_actions_;
};

}  // namespace platform::simulated
