// The collection of button diagnostics.
#pragma once

namespace nrx::keyprobe {

// Prints the button statistics, the diagnostic reports, the haptic assets, and the feature reports
// of the HID device with usage page 0xFF00 and usage 0x20, on standard output. Each step reports
// its own failures and does not stop the steps after it.
void collect_all();

}  // namespace nrx::keyprobe
