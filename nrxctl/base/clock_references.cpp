#include "nrxctl/base/clock_references.h"

namespace nrx {

double tick_period = 0;
double wall_reference = 0;
double monotonic_reference = 0;

}  // namespace nrx
