#include "platform/virtual/wrist_device.h"

#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

std::unique_ptr<machine> make_wrist_device() {
    auto device = std::make_unique<machine>();
    device->clock().follow_host();
    add_interface_services(*device);
    add_hid_devices(*device);
    add_feature_reports(*device);
    add_button_reports(*device);
    add_haptic_assets(*device);
    add_diagnostic_reports(*device);
    add_error_statistics(*device);
    add_sample_ranges(*device);
    add_sensors(*device);
    add_sensor_clients(*device);
    add_sensor_state(*device);
    add_extra_info(*device);
    add_hid_interfaces(*device);
    add_clocks(*device);
    add_profiler(*device);
    add_replay(*device);
    add_named_properties(*device);
    add_mca(*device);
    add_hid_driver(*device);
    add_spi_records(*device);
    add_hid_events(*device);
    return device;
}

}  // namespace platform::simulated
