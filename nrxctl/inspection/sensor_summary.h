// What a sensor of any kind tells about itself.
#pragma once

#include <string_view>

#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

// Prints a sensor's properties, a labelled line each. The calibration matrix and offset and the
// orientation have no line if they were not read; anything else shows its failure value.
void print_sensor_summary(std::string_view service_name, const sensor_properties& sensor);

}  // namespace nrx
