// The event loop of a virtual host.
#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "platform/handle.h"
#include "platform/return_code.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

// Something that calls back from the event loop.
class loop_source {
public:
    loop_source() = default;
    loop_source(const loop_source&) = delete;
    loop_source& operator=(const loop_source&) = delete;
    loop_source(loop_source&&) = delete;
    loop_source& operator=(loop_source&&) = delete;
    virtual ~loop_source() = default;

    // When the next callback comes about if nobody intervenes; none: never.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const = 0;

    // Makes that callback; its time has come.
    virtual void call_back() = 0;
};

class event_loop {
public:
    // Puts the source of a handle on the loop, where it calls back as often as something is due,
    // however often it was put there; takes it off again.
    void schedule(handle_id owner, const std::shared_ptr<loop_source>& source);
    void unschedule(handle_id owner);

    // Ends the run, or the next one.
    void stop() { stop_asked_ = true; }

    // Runs until it is stopped or the time has come; with what is due by then calling back.
    return_code run(machine_clock& clock, std::optional<machine_clock::time> until);

private:
    struct scheduled_source {
        handle_id owner;
        std::shared_ptr<loop_source> source;
    };
    struct due_source {
        machine_clock::time at;
        std::shared_ptr<loop_source> source;
    };

    [[nodiscard]] std::optional<due_source> next_source() const;

    std::vector<scheduled_source> scheduled_;
    bool stop_asked_ = false;
};

}  // namespace platform::simulated
