// From a tag to an event.
#pragma once

#include <string_view>

#include "nrxctl/replay/virtual_event.h"

namespace nrx {

// Makes a new event of some class.
using event_maker = event_ptr (*)();

// That of the class with that tag: "accel", "gyro", "compass" or "pressure"; null for any other.
event_maker find_event_maker(std::string_view tag);

// A new event of the class with that tag, null likewise.
event_ptr make_event(std::string_view tag);

}  // namespace nrx
