// What there is, for a user whose sensor is not found.
#pragma once

#include <string_view>

namespace nrx {

// Prints the registry names of all HID interface services in one line, then how a service name was
// looked up: with the prefix and without it, with the address of the matching dictionary and the
// handle of the service found, 0 if none is. A name that cannot be read ends the list.
void print_hid_services(std::string_view service_name);

}  // namespace nrx
