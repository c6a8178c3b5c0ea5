// Builders of the dictionaries that look-ups are made with.
#pragma once

#include <cstdint>
#include <string_view>

#include "platform/registry.h"

namespace nrx {

// Interface services of the coprocessor's driver, and the HID devices that belong to them.
inline constexpr std::string_view interface_class = "KeltoNRXInterface";
inline constexpr std::string_view hid_device_class = "KeltoNRXHIDDevice";

// The property of an interface service that carries its id, a signed 32-bit number.
inline constexpr std::string_view service_id_key = "service_id";

// The interface service with a service id, or with a registry name.
platform::dictionary match_service_id(std::int32_t id);
platform::dictionary match_service_name(std::string_view name);

// Whatever has a registry name, of any class.
platform::dictionary match_name(std::string_view name);

// The HID device at a location, which is the id of its interface service.
platform::dictionary match_hid_device(const platform::property& location);

// One usage of a HID device: {"DeviceUsagePage": page, "DeviceUsage": usage}.
platform::dictionary usage_pair(std::int32_t page, std::int32_t usage);

// The HID devices with any of the given usage pairs: {"DeviceUsagePairs": pairs}.
platform::dictionary match_usage_pairs(platform::array pairs);

}  // namespace nrx
