// From the name of a service, as a user types it, to a registry service.
//
// A service name is "0x" and a hexadecimal service id, or decimal digits only (a decimal service
// id), or a registry name. An id beyond signed 32 bits, or without digits, belongs to no service.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "platform/registry.h"

namespace nrx {

// The name under which the always-on processor registers a service: the prefix "WQR_" and the
// service's own name, cut to 127 characters.
std::string prefixed_name(std::string_view name);

// The interface service with that name or id; none if there is none. A registry name is tried with
// the prefix "WQR_" first (cut to 127 characters), then as given. Reports nothing; the caller owns
// it.
platform::service find_service(std::string_view name);

// Whether find_service finds the service; if not, says so in a line on standard output.
bool service_exists(std::string_view name);

// The HID device that belongs to the interface service with that name, the one whose location is
// the service's id; an id is used as the location directly. None, with a failure report, if a named
// interface service is missing; none without one if there is no such device, or no such id. The
// caller owns it.
platform::service find_hid_device(std::string_view name);

// The service id of a service name, into id: a number is its own id, whether or not such a service
// exists. False, and id untouched, if the name belongs to no service (with a failure report), the
// service has no id, or the number is none.
bool resolve_service_id(std::string_view name, std::int32_t& id);

// The registry name of the interface service with an id, into name. False, with a failure report
// and name untouched, if there is no such service or its name cannot be read.
bool service_name_for_id(std::int32_t id, std::string& name);

}  // namespace nrx
