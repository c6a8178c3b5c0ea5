// What every report printer is.
#pragma once

#include <cstdint>
#include <string_view>

#include "platform/bytes.h"

namespace nrx {

// Prints one report of a service on standard output. A reply without bytes is an empty view.
using report_printer = void (*)(std::string_view service_name, std::int32_t report_id,
                                platform::byte_view report);

}  // namespace nrx
