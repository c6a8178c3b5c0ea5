// What the virtual host's calls need to know about interrupts.
#pragma once

#include <chrono>
#include <optional>

namespace platform::simulated {

// Runs the registered handler if an interrupt was noted, but not inside of itself. Every platform
// call ends with this.
void serve_interrupt();

// Blocks for that long, or without end, or until an interrupt is noted; at once if one was noted
// since the last time. It may return early for an interrupt that was served in between.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout);

}  // namespace platform::simulated
