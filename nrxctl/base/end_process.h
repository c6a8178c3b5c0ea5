// The one place where the library ends the process with a status.
#pragma once

namespace nrx {

// Ends the process with status 1. Stands in an object file of its own, so that a test or fuzz
// harness can link another definition, one that throws.
[[noreturn]] void end_process();

}  // namespace nrx
