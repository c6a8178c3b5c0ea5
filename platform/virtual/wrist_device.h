// The embedded device: a believable wrist-worn NRX.
#pragma once

#include <memory>

#include "platform/virtual/machine.h"

namespace platform::simulated {

// A new wrist device with every service, report and HID device that the tool can ask about.
std::unique_ptr<machine> make_wrist_device();

}  // namespace platform::simulated
