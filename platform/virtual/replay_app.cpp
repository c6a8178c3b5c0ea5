#include "platform/virtual/replay_app.h"

#include <algorithm>
#include <array>
#include <utility>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/return_codes.h"

namespace platform::simulated {

namespace {

constexpr std::size_t entry_size = 12;
constexpr std::size_t header_size = 20;

constexpr std::uint32_t max_completion_policy = 3;
constexpr std::uint32_t min_location = 1;
constexpr std::uint32_t max_location = 2;

bool has_valid_header(byte_view request) {
    if (request.size() < header_size) return false;
    const std::uint32_t completion_policy = load_u32(request, 4);
    const std::uint32_t location = load_u32(request, 8);
    const std::uint32_t filter = load_u32(request, 12);
    const std::uint32_t byte_count = load_u32(request, 16);
    return completion_policy <= max_completion_policy && location >= min_location &&
           location <= max_location && filter <= 1 && byte_count == request.size() - header_size;
}

// Returns true if the bytes are one or more complete records.
bool are_records(byte_view bytes, std::uint32_t record_size) {
    if (bytes.empty() || bytes.size() % record_size != 0) return false;
    for (std::size_t offset = 0; offset < bytes.size(); offset += record_size) {
        if (load_u32(bytes, offset) != record_size) return false;
    }
    return true;
}

}  // namespace

// --- the application ---

replay_app::replay_app(const std::vector<replay_service>& services) {
    for (const replay_service& service : services)
        services_.push_back({service, 0, inactive});
}

replay_app::service_state* replay_app::find(std::uint32_t id) {
    const auto match =
        std::find_if(services_.begin(), services_.end(), [&](const service_state& candidate) {
            return static_cast<std::uint32_t>(candidate.service.id) == id;
        });
    return match == services_.end() ? nullptr : &*match;
}

byte_list replay_app::states() const {
    byte_list report(services_.size() * entry_size);
    std::size_t offset = 0;
    for (const service_state& service : services_) {
        store_le(report, offset, 4, static_cast<std::uint32_t>(service.service.id));
        store_le(report, offset + 4, 4, service.delay);
        store_le(report, offset + 8, 4, service.state);
        offset += entry_size;
    }
    return report;
}

return_code replay_app::set_state(std::uint32_t id, std::uint32_t delay, std::uint32_t state) {
    service_state* service = find(id);
    if (service == nullptr) return not_found;
    if (state != loaded && state != enabled) return bad_argument;
    if (service->state == inactive) return not_ready;
    service->delay = delay;
    service->state = state;
    return success;
}

return_code replay_app::set_states(byte_view entries) {
    if (entries.empty() || entries.size() % entry_size != 0) return bad_argument;
    const std::vector<service_state> previous = services_;
    for (std::size_t offset = 0; offset < entries.size(); offset += entry_size) {
        const return_code result =
            set_state(load_u32(entries, offset), load_u32(entries, offset + 4),
                      load_u32(entries, offset + 8));
        if (result == success) continue;
        services_ = previous;
        return result;
    }
    return success;
}

return_code replay_app::load(byte_view request) {
    if (!has_valid_header(request)) return bad_argument;
    service_state* service = find(load_u32(request, 0));
    if (service == nullptr) return not_found;
    if (!are_records(request.subspan(header_size), service->service.record_size))
        return bad_argument;
    if (service->state != inactive) return not_ready;
    service->state = loaded;
    return success;
}

return_code replay_app::unload(byte_view request) {
    if (request.size() != sizeof(std::uint32_t)) return bad_argument;
    service_state* service = find(load_u32(request, 0));
    if (service == nullptr) return not_found;
    if (service->state == inactive) return not_ready;
    service->state = inactive;
    service->delay = 0;
    return success;
}

// --- its service and client ---

void serve_replay(interface_driver& service, const std::shared_ptr<replay_app>& app) {
    constexpr std::uint32_t state_report = 0x47;
    service.set_report(state_report, {});
    service.set_report_source(state_report, [app](std::size_t /*capacity*/, byte_list& reply) {
        reply = app->states();
        return success;
    });
    service.set_report_sink(state_report,
                            [app](byte_view entries) { return app->set_states(entries); });
}

namespace {

class replay_client final : public driver {
public:
    explicit replay_client(std::shared_ptr<replay_app> app) : app_(std::move(app)) {}

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        using method = simulated::method<replay_client>;
        using enum argument_rule;
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

std::shared_ptr<driver> make_replay_client(std::shared_ptr<replay_app> app) {
    return std::make_shared<replay_client>(std::move(app));
}

}  // namespace platform::simulated
