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

    // A method's selector is its place in the table. Each takes a structure and gives nothing.
    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        static constexpr std::array methods{&replay_app::load, &replay_app::unload};
        constexpr method_shape shape{0, presence::required, 0, presence::none};
        if (selector >= methods.size()) return unsupported;
        const return_code fitting = check_shape(shape, inputs, outputs);
        return fitting == success ? ((*app_).*methods[selector])(inputs.structure) : fitting;
    }

private:
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
