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

bool satisfies(argument_rule rule, std::size_t size) {
    return rule == argument_rule::optional || (rule == argument_rule::required) == (size > 0);
}

}  // namespace

return_code check_arguments(const method_signature& signature, const call_inputs& inputs,
                            const call_outputs& outputs) {
    const bool matches = inputs.scalars.size() == signature.scalars_in &&
                         outputs.scalars.size() == signature.scalars_out &&
                         satisfies(signature.structure_in, inputs.structure.size()) &&
                         satisfies(signature.structure_out, outputs.structure.size());
    return matches ? success : bad_argument;
}

return_code copy_reply(byte_view reply, call_outputs& outputs) {
    if (reply.size() > outputs.structure.size()) return buffer_too_small;
    std::copy(reply.begin(), reply.end(), outputs.structure.begin());
    outputs.structure = outputs.structure.first(reply.size());
    return success;
}

}  // namespace platform::simulated
