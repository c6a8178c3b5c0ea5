// What the motion sensors tell besides: ranges and bandwidths, or a magnetometer's matrices.
#pragma once

#include <string_view>

namespace nrx {

// Reads and prints the further reports of the services "accel", "gyro" and "compass", a labelled
// line each; a line whose report is not read says so or stays empty. Any other service prints
// nothing.
void print_motion_sensor(std::string_view service_name);

}  // namespace nrx
