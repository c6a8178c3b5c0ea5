#include "nrxctl/base/tick_period.h"

namespace nrx {

double tick_period = 0;

}  // namespace nrx
