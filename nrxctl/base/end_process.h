// The only place where the library exits.
#pragma once

namespace nrx {

// Ends the process with status 1. Defined in an object file of its own, so that test and fuzz
// programs can link a definition that throws instead.
[[noreturn]] void end_process();

}  // namespace nrx
