// The parts that the wrist device is put together from, one file each.
#pragma once

#include <cstdint>

#include "platform/virtual/machine.h"

namespace platform::simulated {

// The interface services with their ids. Every other part builds on these: they come first.
void add_interface_services(machine& device);

// The HID devices of the services that have one.
void add_hid_devices(machine& device);

// The feature reports of the button's HID device.
void add_feature_reports(machine& device);

// The button's statistics and diagnostic reports.
void add_button_reports(machine& device);

// The button's haptic asset table.
void add_haptic_assets(machine& device);

// The diagnostic reports of the other services.
void add_diagnostic_reports(machine& device);

// Input-report error statistics and bus transfer errors.
void add_error_statistics(machine& device);

// The sample ranges of the motion sensors.
void add_sample_ranges(machine& device);

// What the sensors tell about themselves.
void add_sensors(machine& device);

// The clients of the sensors.
void add_sensor_clients(machine& device);

// The registers of the sensors, and the performance counters of the processor that serves them.
void add_sensor_state(machine& device);

// What the firmware of the sensors tells besides.
void add_extra_info(machine& device);

// The HID interfaces, and the events of each, behind the HID devices.
void add_hid_interfaces(machine& device);

// The boot time, and the time-sync service.
void add_clocks(machine& device);

// The profiler: the kernel's driver, and the service "profile". Once enabled, it produces that many
// events in a second.
void add_profiler(machine& device, std::uint32_t events_per_second = 50);

// The replay application.
void add_replay(machine& device);

// Named properties of services, and the self-test of the motion sensors.
void add_named_properties(machine& device);

// What switches the MCA: the commands and reports of the service "mca".
void add_mca(machine& device);

// The driver of all HID devices, which answers requests about them.
void add_hid_driver(machine& device);

// The SPI status records of the HID devices.
void add_spi_records(machine& device);

// The HID event system.
void add_hid_events(machine& device);

}  // namespace platform::simulated
