// The parts of the wrist device, and how they access its interface services.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "platform/bytes.h"
#include "platform/virtual/interface_driver.h"
#include "platform/virtual/machine.h"

namespace platform::simulated {

// --- access to interface services ---

// The driver of an interface service, which must exist.
interface_driver& interface_of(const machine& device, std::string_view service);

// A report and the service that it belongs to.
struct service_report {
    std::string_view service;
    std::uint32_t id;
    byte_view bytes;
};

void add_reports(const machine& device, std::span<const service_report> reports);

// --- parts ---

// The interface services with their ids. All other parts but the clocks and the HID events need
// them.
void add_interface_services(machine& device);

// Named properties of services, and the self-test of the motion sensors.
void add_named_properties(machine& device);

// Commands and reports of the service "mca".
void add_mca(machine& device);

// The replay application.
void add_replay(machine& device);

// The profiler: the kernel's driver and the service "profile". Once enabled, it produces the given
// number of events per second.
void add_profiler(machine& device, std::uint32_t events_per_second = 50);

// The boot time and the time-sync service.
void add_clocks(machine& device);

// The HID devices with their event paths, SPI status records and driver.
void add_hid_devices(machine& device);

// The reports of the button. Needs the HID devices.
void add_button(machine& device);

// The diagnostic reports of other services, and error statistics.
void add_diagnostic_reports(machine& device);

// The reports of the sensors.
void add_sensors(machine& device);
void add_sensor_details(machine& device);

// The HID event system.
void add_hid_events(machine& device);

}  // namespace platform::simulated
