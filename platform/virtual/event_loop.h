// The event loop of a virtual host.
#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "platform/handle.h"
#include "platform/return_code.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

// An object that calls back from the event loop.
class loop_source {
public:
    loop_source() = default;
    loop_source(const loop_source&) = delete;
    loop_source& operator=(const loop_source&) = delete;
    loop_source(loop_source&&) = delete;
    loop_source& operator=(loop_source&&) = delete;
    virtual ~loop_source() = default;

    // Time of the next callback; nullopt if there is none.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const = 0;

    // Makes the next callback, which is due.
    virtual void call_back() = 0;
};

class event_loop {
public:
    // Adds the source of a handle to the loop. Adding it again makes no difference.
    void schedule(handle_id owner, const std::shared_ptr<loop_source>& source);
    void unschedule(handle_id owner);

    // Ends the current run, or the next one if the loop is not running.
    void stop() { stop_requested_ = true; }

    // Runs until the loop is stopped or the deadline has passed. Callbacks due at the deadline are
    // still made. Returns deadlock if the run could never end.
    return_code run(machine_clock& clock, std::optional<machine_clock::time> deadline);

private:
    struct scheduled_source {
        handle_id owner;
        std::shared_ptr<loop_source> source;
    };
    struct due_source {
        machine_clock::time time;
        std::shared_ptr<loop_source> source;
    };

    [[nodiscard]] std::optional<due_source> next_source() const;

    std::vector<scheduled_source> scheduled_;
    bool stop_requested_ = false;
};

}  // namespace platform::simulated
