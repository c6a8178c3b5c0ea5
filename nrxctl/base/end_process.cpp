#include "nrxctl/base/end_process.h"

#include <cstdlib>

namespace nrx {

void end_process() {
    std::exit(EXIT_FAILURE);
}

}  // namespace nrx
