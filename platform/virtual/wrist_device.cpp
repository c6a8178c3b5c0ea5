#include "platform/virtual/wrist_device.h"

#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

std::unique_ptr<machine> make_wrist_device() {
    auto device = std::make_unique<machine>();
    device->set_description("virtual NRX, embedded");
    device->clock().follow_host();
    add_interface_services(*device);
    add_named_properties(*device);
    add_mca(*device);
    add_replay(*device);
    add_profiler(*device);
    add_clocks(*device);
    add_hid_devices(*device);
    add_button(*device);
    add_diagnostic_reports(*device);
    add_sensors(*device);
    add_sensor_details(*device);
    add_hid_events(*device);
    return device;
}

}  // namespace platform::simulated
