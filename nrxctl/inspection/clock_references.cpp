#include "nrxctl/inspection/clock_references.h"

namespace nrx {

double wall_reference = 0;
double monotonic_reference = 0;

}  // namespace nrx
