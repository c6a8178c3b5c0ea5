// What stands behind a registry entry: the kernel's side of a connection.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>

#include "platform/connection.h"
#include "platform/virtual/shared_queue.h"

namespace platform::simulated {

// A driver answers as a kernel driver would, and checks what it is sent as strictly.
class driver {
public:
    driver() = default;
    driver(const driver&) = delete;
    driver& operator=(const driver&) = delete;
    driver(driver&&) = delete;
    driver& operator=(driver&&) = delete;
    virtual ~driver() = default;

    // Whether a connection of this type may be opened; type 0 unless a driver says otherwise.
    virtual return_code open(std::uint32_t type);

    // One method call. On success the spans of outputs are cut to what was returned.
    virtual return_code call(std::uint32_t selector, const call_inputs& inputs,
                             call_outputs& outputs) = 0;

    // The queue in the memory of that type, and the one whose data are signalled as notifications
    // of that type; null if there is none, as it is unless a driver says otherwise.
    virtual std::shared_ptr<shared_queue> memory(std::uint32_t type);
    virtual std::shared_ptr<shared_queue> notification(std::uint32_t type);
};

// Whether a method takes or gives a structure.
enum class presence { none, optional, required };

// What a driver's method takes and gives, checked before the method runs.
struct method_shape {
    std::size_t scalars_in;
    presence structure_in;
    std::size_t scalars_out;
    presence structure_out;
};

// success if the arguments have the method's shape, else bad_argument.
return_code check_shape(const method_shape& shape, const call_inputs& inputs,
                        const call_outputs& outputs);

// A row in the table of a driver's methods.
template <class Driver>
struct method {
    std::uint32_t selector;
    method_shape shape;
    return_code (Driver::*run)(const call_inputs& inputs, call_outputs& outputs);
};

// Runs the method with that selector if the arguments have its shape; unsupported if there is none.
template <class Driver, std::size_t Count>
return_code run_method(Driver& of, const std::array<method<Driver>, Count>& methods,
                       std::uint32_t selector, const call_inputs& inputs, call_outputs& outputs) {
    const auto* row = std::find_if(
        methods.begin(), methods.end(),
        [&](const method<Driver>& candidate) { return candidate.selector == selector; });
    if (row == methods.end()) return unsupported;
    const return_code fitting = check_shape(row->shape, inputs, outputs);
    return fitting == success ? (of.*row->run)(inputs, outputs) : fitting;
}

// Answers with reply in the structure output and cuts it to size; no_room if it is too small.
return_code answer(byte_view reply, call_outputs& outputs);

}  // namespace platform::simulated
