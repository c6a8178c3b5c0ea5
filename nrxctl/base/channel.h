// A connection to a named interface service, for the length of one operation.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/failure_report.h"
#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

// The connection is closed before the service is released.
struct channel {
    platform::service service;
    platform::connection connect;
};

// Opens a connection of the given type on a service that was looked up before. Fails, with a
// failure report for the check that did not hold, with not_found if the look-up found none, the
// platform's code if the service cannot be opened, and no_memory if opening hands back no
// connection.
platform::return_code open_channel(platform::service found, std::uint32_t type, channel& opened);

// Finds a service by name and opens a connection of type 0 on it. Fails as the above does, but for
// a missing service silently if so asked.
platform::return_code open_channel(std::string_view service_name, channel& opened,
                                   expected_failure missing = expected_failure::is_reported);

}  // namespace nrx
