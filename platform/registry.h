// The host's driver registry: lookup, entry names, properties.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/handle.h"
#include "platform/property.h"
#include "platform/return_code.h"

namespace platform {

struct service_kind {
    static void release(handle_id id);
};

// A reference to a registry entry.
using service = handle<service_kind>;

// Keys of a matching dictionary. An entry matches if every key matches; an unknown key matches
// nothing.
inline constexpr std::string_view provider_class_key = "IOProviderClass";  // class or base class
inline constexpr std::string_view name_match_key = "IONameMatch";          // registry name
inline constexpr std::string_view property_match_key = "IOPropertyMatch";  // names and values
inline constexpr std::string_view location_id_key = "LocationID";          // property "LocationID"
inline constexpr std::string_view usage_pairs_key = "DeviceUsagePairs";    // any common pair
inline constexpr std::string_view usage_page_key = "DeviceUsagePage";      // inside a pair
inline constexpr std::string_view usage_key = "DeviceUsage";               // inside a pair

// The registry plane in which a driver's clients are its children.
inline constexpr std::string_view service_plane = "IOService";

// Returns a matching dictionary for the services of a class.
inline dictionary matching_class(std::string_view class_name) {
    return {{std::string(provider_class_key), class_name}};
}

// Finds the first matching service in registration order. Returns an empty handle if none matches.
service first_match(const dictionary& matching);

// Replaces the contents of services with every matching service in registration order, possibly
// none. Fails with the host's code if the registry cannot be enumerated; services is then
// unchanged.
return_code all_matches(const dictionary& matching, std::vector<service>& services);

// Finds the first child of an entry in a plane. Returns an empty handle if the entry has no
// children or is gone.
service first_child(const service& parent, std::string_view plane);

// Stores the registry name of an entry, at most 127 characters, in name. Fails with not_found if
// the entry is gone; name is then unchanged.
return_code entry_name(const service& entry, std::string& name);

// Returns a copy of a property; nullopt if there is no such property or the entry is gone.
std::optional<property> read_property(const service& entry, std::string_view name);

// Like the above, but stores the property in value and reuses its memory, for callers that read a
// property repeatedly. Returns false and leaves value unchanged if there is no such property.
bool read_property(const service& entry, std::string_view name, property& value);

// Sets a property. Fails with not_found if the entry is gone, and with unsupported if its driver
// does not accept properties.
return_code set_property(const service& entry, std::string_view name, const property& value);

}  // namespace platform
