// The services that the coprocessor's driver publishes.
#pragma once

#include "platform/return_code.h"

namespace nrx {

// Prints a line with registry name and id for every interface service, in registration order, on
// standard output. Fails, with a failure report, with the platform's code if the registry or a name
// cannot be read.
platform::return_code list_services();

}  // namespace nrx
