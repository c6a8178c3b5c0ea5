// The identifiers that a user gives on the command line and the driver takes.
#pragma once

#include <cstdint>

namespace nrx {

// Identifies a report of an interface service. Drivers use 0x00 to 0xff.
using report_id = std::uint32_t;

// Identifies an interface service: the value of its property "service_id".
using service_id = std::int32_t;

// A service id as the word that a request or a report holds.
constexpr std::uint32_t wire_word(service_id id) {
    return static_cast<std::uint32_t>(id);
}

}  // namespace nrx
