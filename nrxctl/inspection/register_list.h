// Report 0x38 of a sensor: the registers of its part.
#pragma once

#include <string_view>

namespace nrx {

// Reads and prints a sensor's registers in one line. A list that counts more registers than came
// back is a failed check, and none of them is printed.
void print_register_list(std::string_view service_name);

}  // namespace nrx
