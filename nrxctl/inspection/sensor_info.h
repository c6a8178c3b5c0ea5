// The report of one sensor: what `--sensor` prints.
#pragma once

#include <cstdint>
#include <string_view>

namespace nrx {

// Prints the properties of a sensor service, a labelled line each, and the lines that only "accel",
// "gyro" and "compass" have; at detail level 2 also its clients, the reports of its firmware and
// its event statistics. If the sample interval cannot be read, prints a line that says so instead,
// and, if there is no such service, the available HID services.
void print_sensor_info(std::string_view service_name, std::int32_t level);

}  // namespace nrx
