// From a tag to an event.
#pragma once

#include <string_view>

#include "nrxctl/replay/virtual_event.h"

namespace nrx {

// A new event of the class with that tag: "accel", "gyro", "compass" or "pressure"; null for any
// other.
event_ptr make_event(std::string_view tag);

}  // namespace nrx
