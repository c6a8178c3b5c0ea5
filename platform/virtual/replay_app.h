// The virtual replay application: what its two sides, the interface service and the driver's
// client, share.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

#include "platform/bytes.h"
#include "platform/return_code.h"
#include "platform/virtual/interface_driver.h"

namespace platform::simulated {

// A service that samples can be played back by.
struct replay_service {
    std::int32_t id;
    std::uint32_t record_size;  // bytes; every record begins with this number
};

// Keeps a state for each service: inactive until samples are loaded, loaded until playback is
// enabled, enabled until it is disabled, inactive again when they are unloaded. The samples
// themselves are checked and then forgotten, as nothing is played.
class replay_app {
public:
    static constexpr std::uint32_t inactive = 0;
    static constexpr std::uint32_t loaded = 1;
    static constexpr std::uint32_t enabled = 2;

    explicit replay_app(const std::vector<replay_service>& services);

    // The state report: an entry of three words {service id, delay in seconds, state} for each
    // service.
    [[nodiscard]] byte_list states() const;

    // Enables or disables playback as such entries say. Fails, and changes nothing, with
    // bad_argument if they are no whole entries or a state is neither loaded nor enabled, with
    // not_found for a service that plays no samples back, and with not_ready for one without
    // samples.
    return_code set_states(byte_view entries);

    // Takes the samples of a service: a header of five words {service id, completion policy,
    // location, filter, byte count} and as many bytes of records. Fails with bad_argument if any
    // of this is out of its range or shape, with not_found as above, and with not_ready if the
    // service has samples.
    return_code load(byte_view request);

    // Forgets the samples of the service whose id the request is. Fails likewise; with not_ready if
    // it has none.
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

// Lets the interface service of the application read and write its state.
void serve_replay(interface_driver& service, const std::shared_ptr<replay_app>& app);

// The driver of the application's client, which loads and unloads.
std::shared_ptr<driver> make_replay_client(std::shared_ptr<replay_app> app);

}  // namespace platform::simulated
