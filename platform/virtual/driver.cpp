#include "platform/virtual/driver.h"

#include <algorithm>

#include "platform/virtual/return_codes.h"

namespace platform::simulated {

return_code driver::open(std::uint32_t type) {
    return type == 0 ? success : unsupported;
}

std::shared_ptr<shared_queue> driver::memory(std::uint32_t /*type*/) {
    return nullptr;
}

std::shared_ptr<shared_queue> driver::notification(std::uint32_t /*type*/) {
    return nullptr;
}

namespace {

bool fits(presence wanted, std::size_t given) {
    return wanted == presence::optional || (wanted == presence::required) == (given > 0);
}

}  // namespace

return_code check_shape(const method_shape& shape, const call_inputs& inputs,
                        const call_outputs& outputs) {
    const bool fitting = inputs.scalars.size() == shape.scalars_in &&
                         outputs.scalars.size() == shape.scalars_out &&
                         fits(shape.structure_in, inputs.structure.size()) &&
                         fits(shape.structure_out, outputs.structure.size());
    return fitting ? success : bad_argument;
}

return_code answer(byte_view reply, call_outputs& outputs) {
    if (reply.size() > outputs.structure.size()) return no_room;
    std::copy(reply.begin(), reply.end(), outputs.structure.begin());
    outputs.structure = outputs.structure.first(reply.size());
    return success;
}

}  // namespace platform::simulated
