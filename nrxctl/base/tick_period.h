// The tick of the platform's monotonic clock.
#pragma once

namespace nrx {

// Seconds per tick; process-wide. A front end sets it from the platform before it starts a monitor
// or prints HID events; it is 0 before.
extern double tick_period;

}  // namespace nrx
