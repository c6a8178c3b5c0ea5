// The kernel's half of the virtual profiler as a driver.

#include <algorithm>
#include <array>
#include <utility>

#include "platform/virtual/profiler/profiler.h"

namespace platform::simulated {

namespace {

class profiler_driver final : public driver {
public:
    explicit profiler_driver(std::shared_ptr<profiler> shared) : shared_(std::move(shared)) {}

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override;

    std::shared_ptr<shared_queue> memory(std::uint32_t type) override {
        return type == 0 ? shared_->stream() : nullptr;
    }
    std::shared_ptr<shared_queue> notification(std::uint32_t type) override { return memory(type); }

private:
    std::shared_ptr<profiler> shared_;
};

return_code set_enabled(profiler& of, const call_inputs& inputs, call_outputs& /*outputs*/) {
    if (inputs.scalars[0] > 1) return bad_argument;
    of.set_enabled(inputs.scalars[0] == 1);
    return success;
}

// A client is connected as long as one has the profiler enabled.
return_code read_status(profiler& of, const call_inputs& /*inputs*/, call_outputs& outputs) {
    outputs.scalars[0] = of.stream()->enabled() ? 1 : 0;
    return success;
}

return_code configure(profiler& of, const call_inputs& inputs, call_outputs& /*outputs*/) {
    return of.configure_kernel(inputs.structure);
}

return_code read_configs(profiler& of, const call_inputs& /*inputs*/, call_outputs& outputs) {
    return answer(of.kernel_configs(outputs.structure.size()), outputs);
}

return_code read_error_dump(profiler& of, const call_inputs& /*inputs*/, call_outputs& outputs) {
    return answer(of.take_error_dump(outputs.structure.size()), outputs);
}

return_code read_log(profiler& of, const call_inputs& /*inputs*/, call_outputs& outputs) {
    return answer(of.take_kernel_log(outputs.structure.size()), outputs);
}

return_code dump_errors(profiler& of, const call_inputs& /*inputs*/, call_outputs& /*outputs*/) {
    of.dump_errors();
    return success;
}

return_code stop_stream(profiler& of, const call_inputs& /*inputs*/, call_outputs& /*outputs*/) {
    of.stop_stream();
    return success;
}

struct method {
    std::uint32_t selector;
    method_shape shape;
    return_code (*run)(profiler& of, const call_inputs& inputs, call_outputs& outputs);
};

constexpr std::array methods{
    method{0, {1, presence::none, 0, presence::none}, set_enabled},
    method{1, {0, presence::none, 1, presence::none}, read_status},
    method{2, {0, presence::optional, 0, presence::none}, configure},
    method{3, {0, presence::none, 0, presence::required}, read_configs},
    method{8, {0, presence::none, 0, presence::required}, read_error_dump},
    method{9, {0, presence::none, 0, presence::required}, read_log},
    method{10, {0, presence::none, 0, presence::none}, dump_errors},
    method{11, {0, presence::none, 0, presence::none}, stop_stream},
};

return_code profiler_driver::call(std::uint32_t selector, const call_inputs& inputs,
                                  call_outputs& outputs) {
    const auto* row = std::find_if(methods.begin(), methods.end(), [&](const method& candidate) {
        return candidate.selector == selector;
    });
    if (row == methods.end()) return unsupported;
    const return_code shape = check_shape(row->shape, inputs, outputs);
    return shape == success ? row->run(*shared_, inputs, outputs) : shape;
}

}  // namespace

std::shared_ptr<profiler> add_profiler_driver(machine& host) {
    auto shared = std::make_shared<profiler>(host.clock());
    host.add({.name = "KeltoNRXProfileDriver",
              .classes = {"KeltoNRXProfileDriver"},
              .unit = std::make_shared<profiler_driver>(shared)});
    return shared;
}

}  // namespace platform::simulated
