// A connection to a named interface service, for the length of one operation.
#pragma once

#include <string_view>

#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

// The connection is closed before the service is released.
struct channel {
    platform::service service;
    platform::connection connect;
};

enum class missing_service { is_reported, is_silent };

// Finds a service by name and opens a connection of type 0 on it. Fails, with a failure report for
// the check that did not hold, with not_found if there is no such service (silently if so asked),
// the platform's code if the service cannot be opened, and no_memory if opening hands back no
// connection.
platform::return_code open_channel(std::string_view service_name, missing_service missing,
                                   channel& opened);

}  // namespace nrx
