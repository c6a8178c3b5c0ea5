// A connection to a service for the length of one operation.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/failure_report.h"
#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

// The connection is closed before the service is released.
struct service_channel {
    platform::service service;
    platform::connection connection;
};

// Opens a connection of the given type on a service. Fails with a failure report that names the
// caller's location: with the platform's code if the service cannot be opened, and with no_memory
// if the platform returns no connection.
platform::return_code open_connection(const platform::service& service, std::uint32_t type,
                                      platform::connection& connection,
                                      source_location location = source_location::current());

// Opens a channel of the given connection type on a service that was looked up before. Fails with a
// failure report: with not_found if the service is empty, otherwise as open_connection does.
platform::return_code open_channel(platform::service service, std::uint32_t type,
                                   service_channel& channel);

// Finds a service by name and opens a channel of type 0 on it. Fails as above; on_missing decides
// whether a missing service is reported.
platform::return_code open_channel(std::string_view service_name, service_channel& channel,
                                   on_failure on_missing = on_failure::report);

}  // namespace nrx
