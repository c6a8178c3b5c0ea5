// What the virtual host's calls need to know about interrupts.
#pragma once

#include <chrono>
#include <optional>

namespace platform::simulated {

// Runs the registered handler if an interrupt was noted, but not inside of itself. Every platform
// call that can fail ends with this; waits, sleeps and the event loop do it inside as well.
void serve_interrupt();

// Blocks for that long, or without end, or until an interrupt is noted; not at all if one that was
// noted is not served yet.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout);

}  // namespace platform::simulated
