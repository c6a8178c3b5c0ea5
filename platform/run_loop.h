// The event loop of the calling thread: what is scheduled on it calls back from inside of a run.
#pragma once

#include <chrono>

#include "platform/return_code.h"

namespace platform {

// Runs the loop until it is stopped: everything that comes about on it calls back, one after the
// other in the order of the times at which it comes about. In between the run blocks without using
// the processor, and an interrupt wakes it at once; the interrupt handler runs inside, and may stop
// the loop. Fails with the host's code if nothing can ever call back or end the run.
return_code run_loop();

// The same for so long at most: what comes about later does not call back any more.
return_code run_loop_for(std::chrono::microseconds duration);

// Stops the loop: no further callback is made. A stop is never lost: one that comes while the loop
// does not run ends its next run before the first callback. It ends one run; several stops that
// come before one is served are one.
void stop_loop();

}  // namespace platform
