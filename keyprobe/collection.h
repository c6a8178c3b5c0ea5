// The collection of button diagnostics.
#pragma once

namespace nrx::keyprobe {

// Runs every step of the collection, whatever the steps before it found: button statistics,
// diagnostic reports, haptic assets, HID feature reports. Each step prints what it reads on
// standard output and reports its own failures.
void collect_all();

}  // namespace nrx::keyprobe
