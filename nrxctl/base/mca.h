// Switching the MCA.
#pragma once

#include "platform/return_code.h"

namespace nrx {

// Switches the MCA on or off with a fixed sequence of commands and reports to the service "mca",
// after a line on standard output that says so. The first that fails ends the sequence with its
// code; it is reported twice, where it failed and here.
platform::return_code switch_mca(bool on);

}  // namespace nrx
