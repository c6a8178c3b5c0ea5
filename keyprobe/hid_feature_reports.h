// The feature reports of the button's HID device.
#pragma once

namespace nrx::keyprobe {

// Reads the feature reports 0xe0, 0xb4 and 0xe1 to 0xe4 of the HID device with usage page 0xFF00
// and usage 0x20, and dumps each under a banner on standard output. The first failure is reported
// and ends the step; a close that fails changes nothing any more and is not reported.
void dump_hid_feature_reports();

}  // namespace nrx::keyprobe
