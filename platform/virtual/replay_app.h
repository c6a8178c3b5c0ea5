// The virtual replay application, which has an interface service and a client driver.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

#include "platform/bytes.h"
#include "platform/return_code.h"
#include "platform/virtual/interface_driver.h"

namespace platform::simulated {

// A service that can play back samples.
struct replay_service {
    std::int32_t id;
    std::uint32_t record_size;  // bytes; each record begins with this number
};

// Keeps a state for each service. A service is inactive until samples are loaded, then loaded until
// playback is enabled, enabled until it is disabled, and inactive again once the samples are
// unloaded. Samples are checked and discarded; nothing is played back.
class replay_app {
public:
    static constexpr std::uint32_t inactive = 0;
    static constexpr std::uint32_t loaded = 1;
    static constexpr std::uint32_t enabled = 2;

    explicit replay_app(const std::vector<replay_service>& services);

    // The state report: an entry of three words {service id, delay in seconds, state} for each
    // service.
    [[nodiscard]] byte_list states() const;

    // Enables or disables playback according to such entries. Fails without changing anything: with
    // bad_argument if there are no entries, if one is incomplete, or if a state is neither loaded
    // nor enabled; with not_found if a service cannot play back samples; with not_ready if it has
    // no samples.
    return_code set_states(byte_view entries);

    // Loads the samples of a service. The request is a header of five words {service id, completion
    // policy, location, filter, byte count} and the records. Fails with bad_argument if the request
    // is malformed or a value is out of range, with not_found if the service cannot play back
    // samples, and with not_ready if it has samples already.
    return_code load(byte_view request);

    // Unloads the samples of the service whose id is the request. Fails with bad_argument if the
    // request is malformed, with not_found if the service cannot play back samples, and with
    // not_ready if it has no samples.
    return_code unload(byte_view request);

private:
    struct service_state {
        replay_service service;
        std::uint32_t delay;
        std::uint32_t state;
    };

    service_state* find(std::uint32_t id);
    return_code set_state(std::uint32_t id, std::uint32_t delay, std::uint32_t state);

    std::vector<service_state> services_;
};

// Adds the state report to the interface service of the application.
void serve_replay(interface_driver& service, const std::shared_ptr<replay_app>& app);

// Creates the driver of the application's client, which loads and unloads samples.
std::shared_ptr<driver> make_replay_client(std::shared_ptr<replay_app> app);

}  // namespace platform::simulated
