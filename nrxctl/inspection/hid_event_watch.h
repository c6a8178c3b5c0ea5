// Watching the HID event system.
#pragma once

#include <chrono>
#include <optional>

#include "platform/return_code.h"

namespace nrx {

// Prints HID events, reset notices and statistics updates as they arrive, from the event loop of
// this thread, for the given duration or until the loop is stopped; a watch of print_limit.h. Set
// the clock values of clock_references.h before. Fails, with a failure report, with not_found if
// there is no event system, otherwise with the platform's code.
platform::return_code watch_hid_events(std::optional<std::chrono::seconds> duration);

}  // namespace nrx
