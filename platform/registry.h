// The host's registry of drivers: look-up, entry names, properties.
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

// A reference to one registry entry; released by whoever holds it.
using service = handle<service_kind>;

// The keys that a look-up understands. All keys that are given must match; any other key matches
// nothing.
inline constexpr std::string_view provider_class_key = "IOProviderClass";  // class or a base of it
inline constexpr std::string_view name_match_key = "IONameMatch";          // registry name
inline constexpr std::string_view property_match_key = "IOPropertyMatch";  // property -> value
inline constexpr std::string_view location_id_key = "LocationID";          // property of that name
inline constexpr std::string_view usage_pairs_key = "DeviceUsagePairs";    // any pair in common
inline constexpr std::string_view usage_page_key = "DeviceUsagePage";      // inside a pair
inline constexpr std::string_view usage_key = "DeviceUsage";               // inside a pair

// The plane that relates drivers to the drivers attached to them.
inline constexpr std::string_view service_plane = "IOService";

// A matching dictionary for the services of a class.
dictionary matching_class(std::string_view class_name);

// The first service, in registration order, that matches; none if there is none. The caller owns
// it.
service first_match(const dictionary& matching);

// Every service that matches, in registration order, into found. The caller owns them. Fails with
// the host's code if the registry cannot be enumerated; found is then untouched. No match is a
// success with nothing found.
return_code all_matches(const dictionary& matching, std::vector<service>& found);

// The first child of an entry in a plane; none if it has none or is gone. The caller owns it.
service first_child(const service& parent, std::string_view plane);

// The registry name of an entry, at most 127 characters, into name. Fails with not_found if the
// entry is gone; name is then untouched.
return_code entry_name(const service& entry, std::string& name);

// A copy of an entry's property; none if there is no such property or the entry is gone.
std::optional<property> read_property(const service& entry, std::string_view name);

// The same, into value, for those who read a property over and over: the room that value has is
// used again. False, and value untouched, if there is none.
bool read_property(const service& entry, std::string_view name, property& value);

// Sets an entry's property. Fails with not_found if the entry is gone and with unsupported if its
// driver takes no properties.
return_code set_property(const service& entry, std::string_view name, const property& value);

}  // namespace platform
