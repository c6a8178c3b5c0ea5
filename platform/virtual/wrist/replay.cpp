// The replay application: the motion and pressure sensors can play samples back, and have none yet.

#include <array>

#include "platform/virtual/replay_app.h"
#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct replay_row {
    std::string_view service;
    std::uint32_t record_size;
};

constexpr std::array replaying{
    replay_row{"accel", 28},
    replay_row{"gyro", 28},
    replay_row{"compass", 28},
    replay_row{"pressure", 20},
};

std::int32_t id_of(const machine& device, std::string_view service) {
    const auto id = device.find(service)->properties.find("service_id")->number();
    return static_cast<std::int32_t>(id.value_or(0));
}

}  // namespace

void add_replay(machine& device) {
    std::vector<replay_service> services;
    for (const replay_row& row : replaying)
        services.push_back({id_of(device, row.service), row.record_size});
    const auto app = std::make_shared<replay_app>(services);
    serve_replay(interface_of(device, "NRXApp"), app);
    device.find("NRXAppClient")->unit = make_replay_client(app);
}

}  // namespace platform::simulated
