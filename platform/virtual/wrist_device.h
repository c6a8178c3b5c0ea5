// The embedded device: a wrist-worn NRX.
#pragma once

#include <memory>

#include "platform/virtual/machine.h"

namespace platform::simulated {

// Creates a wrist device with every service, report and HID device that the tool asks for.
std::unique_ptr<machine> make_wrist_device();

}  // namespace platform::simulated
