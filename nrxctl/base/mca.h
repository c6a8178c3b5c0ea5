// Switching the MCA.
#pragma once

#include "platform/return_code.h"

namespace nrx {

// Prints a line on standard output, then switches the MCA on or off with a fixed sequence of
// commands and reports to the service "mca". The first failure ends the sequence and is returned;
// it is reported twice, by the call and here.
platform::return_code switch_mca(bool on);

}  // namespace nrx
