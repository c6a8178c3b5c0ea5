#include "nrxctl/inspection/hid_event_times.h"

namespace nrx {

double wall_reference = 0;
double monotonic_reference = 0;
double first_event_time = 0;
double last_event_time = 0;
double last_wall_time = 0;

}  // namespace nrx
