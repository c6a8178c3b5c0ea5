// Opening a connection, checked.
#pragma once

#include <cstdint>

#include "nrxctl/base/source_place.h"
#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

// Opens a connection of the given type on a service. Fails, with a failure report from the place of
// the call, with the platform's code if the service cannot be opened, and no_memory if opening
// hands back no connection.
platform::return_code open_connection(const platform::service& service, std::uint32_t type,
                                      platform::connection& connect,
                                      source_place place = source_place::here());

}  // namespace nrx
