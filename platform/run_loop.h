// The event loop (run loop) of the calling thread. Scheduled objects call back while it runs.
#pragma once

#include <chrono>

#include "platform/return_code.h"

namespace platform {

// Runs the loop until it is stopped. Callbacks are made one at a time, in the order of their due
// times. Between callbacks the loop blocks without using the processor. An interrupt wakes it at
// once; the interrupt handler runs inside the loop and may stop it. Fails with the host's code if
// nothing can ever call back or end the run.
return_code run_loop();

// Like run_loop, but ends after the given duration. Callbacks due later are not made.
return_code run_loop_for(std::chrono::microseconds duration);

// Stops the loop before its next callback. A stop is never lost: if the loop is not running, its
// next run ends before the first callback. Each run serves all stops that are pending.
void stop_loop();

}  // namespace platform
