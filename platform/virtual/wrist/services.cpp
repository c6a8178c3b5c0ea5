#include "platform/virtual/wrist/services.h"

#include <array>
#include <cassert>
#include <memory>
#include <string>

#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

struct service_row {
    std::string_view name;   // registry name
    std::int32_t id;         // "service_id"
    std::string_view child;  // what clients of the service open instead of it; empty: nothing
};

// In registration order. The always-on processor's own services carry the prefix WQR_.
constexpr std::array services{
    service_row{"accel", 0x10, ""},
    service_row{"gyro", 0x11, ""},
    service_row{"compass", 0x12, ""},
    service_row{"pressure", 0x13, ""},
    service_row{"als", 0x14, ""},
    service_row{"temperature", 0x15, ""},
    service_row{"mux", 0x20, ""},
    service_row{"mca", 0x21, ""},
    service_row{"morvane", 0x22, ""},
    service_row{"baseband", 0x30, ""},
    service_row{"btmspk", 0x31, ""},
    service_row{"arc", 0x32, ""},
    service_row{"WQR_wqr-button", 0x40, ""},
    service_row{"profile", 0x50, ""},
    service_row{"NRXApp", 0x51, "NRXAppClient"},
};

}  // namespace

void add_interface_services(machine& device) {
    for (const service_row& row : services) {
        const auto driver = std::make_shared<interface_driver>();
        const entry_ref service = device.add({.name = std::string(row.name),
                                              .classes = {"KeltoNRXInterface"},
                                              .properties = {{"service_id", row.id}},
                                              .unit = driver});
        if (row.child.empty()) continue;
        device.add({.name = std::string(row.child),
                    .classes = {"KeltoNRXInterfaceClient"},
                    .unit = driver},
                   service);
    }
}

interface_driver& interface_of(const machine& device, std::string_view service) {
    const entry_ref entry = device.find(service);
    assert(entry);
    auto* driver = dynamic_cast<interface_driver*>(entry->unit.get());
    assert(driver != nullptr);
    return *driver;
}

void put_reports(const machine& device, std::span<const service_report> reports) {
    for (const service_report& row : reports) {
        interface_of(device, row.service)
            .set_report(row.id, byte_list(row.bytes.begin(), row.bytes.end()));
    }
}

}  // namespace platform::simulated
