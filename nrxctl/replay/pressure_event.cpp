#include "nrxctl/replay/pressure_event.h"

namespace nrx {

bool PressureEvent::parse(const sample_values& values) {
    record_.parse_head(values);
    record_.parse_value(0, values[sample_key::p]);
    timestamp_ = parse_timestamp(values[sample_key::timestamp]);
    return true;
}

}  // namespace nrx
