// Interrupts inside the virtual host.
#pragma once

#include <chrono>
#include <optional>

namespace platform::simulated {

// Runs the registered handler if an interrupt is pending. Does nothing inside the handler itself.
// Every platform call that can fail ends with this; waits, sleeps and the event loop call it too.
void serve_interrupt();

// Blocks until an interrupt is pending or the timeout, if any, has expired. Returns at once if one
// is pending already.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout);

}  // namespace platform::simulated
