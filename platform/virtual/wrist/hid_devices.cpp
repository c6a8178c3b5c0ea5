// The HID devices that stand on interface services.

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "platform/registry.h"
#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

struct usage_row {
    std::int32_t page;
    std::int32_t usage;
};

struct hid_row {
    std::string_view service;  // the interface service; its id is the device's location
    std::string_view name;     // registry name
    usage_row primary;
    usage_row secondary;  // {0, 0}: none
};

constexpr std::array hid_devices{
    hid_row{"accel", "accel-hid", {0x20, 0x73}, {}},
    hid_row{"gyro", "gyro-hid", {0x20, 0x76}, {}},
    hid_row{"compass", "compass-hid", {0x20, 0x83}, {}},
    hid_row{"pressure", "pressure-hid", {0x20, 0x31}, {}},
    hid_row{"als", "als-hid", {0x20, 0x41}, {}},
    hid_row{"temperature", "temperature-hid", {0x20, 0x33}, {}},
    hid_row{"WQR_wqr-button", "wqr-button-hid", {0xff00, 0x20}, {0x0c, 0x40}},
};

dictionary usage_pair(const usage_row& row) {
    return {{std::string(usage_page_key), row.page}, {std::string(usage_key), row.usage}};
}

array usage_pairs(const hid_row& row) {
    array pairs{usage_pair(row.primary)};
    if (row.secondary.page != 0) pairs.emplace_back(usage_pair(row.secondary));
    return pairs;
}

}  // namespace

void add_hid_devices(machine& device) {
    for (const hid_row& row : hid_devices) {
        const entry_ref service = device.find(row.service);
        device.add(
            {.name = std::string(row.name),
             .classes = {"KeltoNRXHIDDevice", "IOHIDDevice"},
             .properties = {{std::string(location_id_key), *service->properties.find("service_id")},
                            {std::string(usage_pairs_key), usage_pairs(row)}},
             .hid = std::make_shared<hid_unit>()},
            service);
    }
}

}  // namespace platform::simulated
