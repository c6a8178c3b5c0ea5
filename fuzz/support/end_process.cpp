// Replaces the library's end_process: throws, so that fuzzing can continue.
#include "nrxctl/base/end_process.h"

#include "fuzz/support/harness.h"

namespace nrx {

void end_process() {
    throw fuzz::process_ended{};
}

}  // namespace nrx
