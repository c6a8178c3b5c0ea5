// Named properties of an interface service, which its driver keeps (those of the registry are in
// service_property.h).
//
// Each operation finds the service by name, opens a connection, makes one call, closes and
// releases. It fails, with a failure report, with not_found for a missing service, the platform's
// code for an open or a call that failed, and no_memory if opening hands back no connection.
#pragma once

#include <string_view>

#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Sets a property to value, any bytes. Fails with no_memory, too, if there is none for the message.
platform::return_code set_named_property(std::string_view service_name,
                                         std::string_view property_name, platform::byte_view value);

// Reads a property into the room that value gives; on success value is cut to the bytes that came
// back, on failure it is as it was. A driver without named properties is also announced on standard
// output.
platform::return_code get_named_property(std::string_view service_name,
                                         std::string_view property_name,
                                         platform::byte_span& value);

}  // namespace nrx
