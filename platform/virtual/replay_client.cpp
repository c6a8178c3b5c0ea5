// The driver through which the virtual replay application gets its samples, and the reports of its
// service.

#include <array>
#include <utility>

#include "platform/virtual/replay_app.h"

namespace platform::simulated {

namespace {

constexpr std::uint32_t state_report = 0x47;

class replay_client final : public driver {
public:
    explicit replay_client(std::shared_ptr<replay_app> app) : app_(std::move(app)) {}

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        using method = simulated::method<replay_client>;
        using enum presence;
        static constexpr std::array methods{
            method{0, {0, required, 0, none}, &replay_client::load},
            method{1, {0, required, 0, none}, &replay_client::unload},
        };
        return run_method(*this, methods, selector, inputs, outputs);
    }

private:
    return_code load(const call_inputs& inputs, call_outputs& /*outputs*/) {
        return app_->load(inputs.structure);
    }

    return_code unload(const call_inputs& inputs, call_outputs& /*outputs*/) {
        return app_->unload(inputs.structure);
    }

    std::shared_ptr<replay_app> app_;
};

}  // namespace

void serve_replay(interface_driver& service, const std::shared_ptr<replay_app>& app) {
    service.set_report(state_report, {});
    service.set_report_source(state_report, [app](std::size_t /*room*/, byte_list& reply) {
        reply = app->states();
        return success;
    });
    service.set_report_sink(state_report,
                            [app](byte_view entries) { return app->set_states(entries); });
}

std::shared_ptr<driver> make_replay_client(std::shared_ptr<replay_app> app) {
    return std::make_shared<replay_client>(std::move(app));
}

}  // namespace platform::simulated
