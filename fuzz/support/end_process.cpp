// Stands in for the library's end of the process: fuzzing goes on after it.
#include "nrxctl/base/end_process.h"

#include "fuzz/support/harness.h"

namespace nrx {

void end_process() {
    throw fuzz::process_ended{};
}

}  // namespace nrx
