#include "nrxctl/inspection/hid_event_state.h"

#include <sstream>

#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"

namespace nrx {

double first_event_time = 0;
double last_event_time = 0;
double last_wall_time = 0;

namespace {

std::ostringstream& line_stream() {
    static std::ostringstream stream;
    return stream;
}

}  // namespace

std::ostream& event_stream() {
    return line_stream();
}

void end_event_line() {
    if (may_print_event()) print_line(line_stream().view());
    line_stream().str({});
}

}  // namespace nrx
