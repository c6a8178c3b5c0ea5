// The driver of a registry entry: the kernel's side of a connection.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>

#include "platform/connection.h"
#include "platform/virtual/shared_queue.h"

namespace platform::simulated {

// Drivers check their arguments as strictly as kernel drivers do.
class driver {
public:
    driver() = default;
    driver(const driver&) = delete;
    driver& operator=(const driver&) = delete;
    driver(driver&&) = delete;
    driver& operator=(driver&&) = delete;
    virtual ~driver() = default;

    // Accepts or refuses a connection of the given type. By default only type 0 is accepted.
    virtual return_code open(std::uint32_t type);

    // Runs a method. On success the spans of outputs are shrunk to what was returned.
    virtual return_code call(std::uint32_t selector, const call_inputs& inputs,
                             call_outputs& outputs) = 0;

    // The queue in the memory of the given type, and the queue whose data is signalled by
    // notifications of the given type. By default there is none, and the result is null.
    virtual std::shared_ptr<shared_queue> memory(std::uint32_t type);
    virtual std::shared_ptr<shared_queue> notification(std::uint32_t type);
};

enum class argument_rule { none, optional, required };

// The arguments that a method accepts, checked before it runs.
struct method_signature {
    std::size_t scalars_in;
    argument_rule structure_in;
    std::size_t scalars_out;
    argument_rule structure_out;
};

// Returns success if the arguments match the signature, otherwise bad_argument.
return_code check_arguments(const method_signature& signature, const call_inputs& inputs,
                            const call_outputs& outputs);

// A row in a driver's table of methods.
template <class Driver>
struct method {
    std::uint32_t selector;
    method_signature signature;
    return_code (Driver::*run)(const call_inputs& inputs, call_outputs& outputs);
};

// Checks the arguments and runs the method with the given selector. Returns unsupported if there is
// no such method.
template <class Driver, std::size_t Count>
return_code run_method(Driver& target, const std::array<method<Driver>, Count>& methods,
                       std::uint32_t selector, const call_inputs& inputs, call_outputs& outputs) {
    const auto* row = std::find_if(
        methods.begin(), methods.end(),
        [&](const method<Driver>& candidate) { return candidate.selector == selector; });
    if (row == methods.end()) return unsupported;
    const return_code result = check_arguments(row->signature, inputs, outputs);
    return result == success ? (target.*row->run)(inputs, outputs) : result;
}

// Copies a reply to the structure output and shrinks the span to it. Returns buffer_too_small if
// the reply does not fit.
return_code copy_reply(byte_view reply, call_outputs& outputs);

}  // namespace platform::simulated
