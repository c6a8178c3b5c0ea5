// The plain scalar call of an interface service.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "platform/return_code.h"

namespace nrx {

// Calls the scalar method of the service with that name, with any count of scalars; nothing comes
// back. Fails, with a failure report, with not_found for a missing service, the platform's code for
// an open or a call that failed, and no_memory if opening hands back no connection.
platform::return_code call_scalar_method(std::string_view service_name,
                                         std::span<const std::uint64_t> scalars);

}  // namespace nrx
