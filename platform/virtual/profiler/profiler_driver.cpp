// The kernel's half of the virtual profiler as a driver.

#include <array>
#include <memory>
#include <utility>

#include "platform/virtual/profiler/profiler.h"

namespace platform::simulated {

namespace {

class profiler_driver final : public driver {
public:
    explicit profiler_driver(std::shared_ptr<profiler> shared) : shared_(std::move(shared)) {}

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        using method = simulated::method<profiler_driver>;
        using enum presence;
        static constexpr std::array methods{
            method{0, {1, none, 0, none}, &profiler_driver::set_enabled},
            method{1, {0, none, 1, none}, &profiler_driver::read_status},
            method{2, {0, optional, 0, none}, &profiler_driver::configure},
            method{3, {0, none, 0, required}, &profiler_driver::read_configs},
            method{8, {0, none, 0, required}, &profiler_driver::read_error_dump},
            method{9, {0, none, 0, required}, &profiler_driver::read_log},
            method{10, {0, none, 0, none}, &profiler_driver::dump_errors},
            method{11, {0, none, 0, none}, &profiler_driver::stop_stream},
        };
        return run_method(*this, methods, selector, inputs, outputs);
    }

    std::shared_ptr<shared_queue> memory(std::uint32_t type) override {
        return type == 0 ? shared_->stream() : nullptr;
    }
    std::shared_ptr<shared_queue> notification(std::uint32_t type) override { return memory(type); }

private:
    return_code set_enabled(const call_inputs& inputs, call_outputs& /*outputs*/) {
        if (inputs.scalars[0] > 1) return bad_argument;
        shared_->set_enabled(inputs.scalars[0] == 1);
        return success;
    }

    // A client is connected as long as one has the profiler enabled.
    return_code read_status(const call_inputs& /*inputs*/, call_outputs& outputs) {
        outputs.scalars[0] = shared_->stream()->enabled() ? 1 : 0;
        return success;
    }

    return_code configure(const call_inputs& inputs, call_outputs& /*outputs*/) {
        return shared_->configure_kernel(inputs.structure);
    }

    return_code read_configs(const call_inputs& /*inputs*/, call_outputs& outputs) {
        return answer(shared_->kernel_configs(outputs.structure.size()), outputs);
    }

    return_code read_error_dump(const call_inputs& /*inputs*/, call_outputs& outputs) {
        return answer(shared_->take_error_dump(outputs.structure.size()), outputs);
    }

    return_code read_log(const call_inputs& /*inputs*/, call_outputs& outputs) {
        return answer(shared_->take_kernel_log(outputs.structure.size()), outputs);
    }

    return_code dump_errors(const call_inputs& /*inputs*/, call_outputs& /*outputs*/) {
        shared_->dump_errors();
        return success;
    }

    return_code stop_stream(const call_inputs& /*inputs*/, call_outputs& /*outputs*/) {
        shared_->stop_stream();
        return success;
    }

    std::shared_ptr<profiler> shared_;
};

}  // namespace

std::shared_ptr<profiler> add_profiler_driver(machine& host) {
    auto shared = std::make_shared<profiler>(host.clock());
    host.add({.name = "KeltoNRXProfileDriver",
              .classes = {"KeltoNRXProfileDriver"},
              .unit = std::make_shared<profiler_driver>(shared)});
    return shared;
}

}  // namespace platform::simulated
