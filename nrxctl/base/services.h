// The services of the coprocessor's drivers in the platform's registry: finding, listing, and
// reading and setting their registry properties.
//
// A service name is "0x" and a hexadecimal service id, or decimal digits only (a decimal service
// id), or a registry name. An id without digits or beyond signed 32 bits matches no service.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/property.h"
#include "platform/registry.h"
#include "platform/return_code.h"

namespace nrx {

// The class of interface services, and the class of the HID devices that belong to them.
inline constexpr std::string_view interface_class = "KeltoNRXInterface";
inline constexpr std::string_view hid_device_class = "KeltoNRXHIDDevice";

// The registry property of an interface service that holds its id.
inline constexpr std::string_view service_id_key = "service_id";

// Dictionaries to look up services with.

// The interface service with a service id, or with a registry name.
platform::dictionary match_service_id(service_id id);
platform::dictionary match_service_name(std::string_view name);

// Any entry with a registry name, whatever its class.
platform::dictionary match_name(std::string_view name);

// The HID device at a location, which is the id of its interface service.
platform::dictionary match_hid_device(const platform::property& location);

// One usage of a HID device: {"DeviceUsagePage": page, "DeviceUsage": usage}.
platform::dictionary usage_pair(std::int32_t page, std::int32_t usage);

// The HID devices with any of the given usage pairs: {"DeviceUsagePairs": pairs}.
platform::dictionary match_usage_pairs(platform::array pairs);

// The name under which the always-on processor registers a service: the prefix "WQR_" and the
// service's own name, cut to 127 characters.
std::string prefixed_name(std::string_view name);

// Returns a registry name without that prefix.
std::string_view without_prefix(std::string_view registry_name);

// Returns the interface service with that name or id, or an empty handle. A registry name is tried
// with the prefix "WQR_" first, then as given. Reports nothing.
platform::service find_service(std::string_view name);

// Explains that no interface service has that name or id, and which name is similar.
void explain_missing_service(std::string_view name);

// Returns true if a service name is an id.
bool is_service_id(std::string_view name);

// Returns true if find_service finds the service; otherwise prints a line on standard output that
// says so.
bool service_exists(std::string_view name);

// Returns the HID device that belongs to the interface service with that name, or an empty handle.
// An id is the location of the device itself. A missing interface service is reported; a missing
// device and an invalid id are not.
platform::service find_hid_device(std::string_view name);

// Stores the service id that a service name stands for in id. A number is its own id, whether or
// not such a service exists. Returns false and leaves id unchanged if the named service does not
// exist (with a failure report), has no id, or the number is not a valid id.
bool resolve_service_id(std::string_view name, service_id& id);

// Stores the registry name of the interface service with that id in name. Returns false with a
// failure report and leaves name unchanged if there is no such service or its name cannot be read.
bool service_name_for_id(service_id id, std::string& name);

// Prints a line with registry name and id for every interface service, in registration order, on
// standard output. Fails, with a failure report, with the platform's code if the registry or a name
// cannot be read.
platform::return_code list_services();

// Sets a registry property. Fails, with a failure report, with bad_argument if name or value is
// null, otherwise with the platform's code.
platform::return_code set_service_property(const platform::service& service, const char* name,
                                           const platform::property* value);

// Writes the platform's description of a registry property as a line on standard error. A null name
// or a missing property is reported as a failure. Always returns success.
platform::return_code show_service_property(const platform::service& service, const char* name);

}  // namespace nrx
