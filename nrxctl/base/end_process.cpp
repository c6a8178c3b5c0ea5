#include "nrxctl/base/end_process.h"

#include <cstdlib>

#include "nrxctl/base/output.h"

namespace nrx {

void end_process() {
    flush_output();
    std::exit(EXIT_FAILURE);
}

}  // namespace nrx
