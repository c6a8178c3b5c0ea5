// All about one sensor: what `--sensor` prints.
#pragma once

#include <cstdint>
#include <string_view>

namespace nrx {

// Prints a labelled summary of a sensor service ("accel", "gyro", "compass" or any other); at
// detail level 2 also its clients, extra information, registers, performance counters and event
// statistics. A service that does not tell its sample interval has no summary: a line says so, and
// if there is no such service, the list of those that there are follows.
void print_sensor_info(std::string_view service_name, std::int32_t level);

}  // namespace nrx
