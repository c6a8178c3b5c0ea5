#include "nrxctl/base/channel.h"

#include <utility>

#include "nrxctl/base/check.h"
#include "nrxctl/base/services.h"

namespace nrx {

platform::return_code open_connection(const platform::service& service, std::uint32_t type,
                                      platform::connection& connection, source_location location) {
    const platform::return_code kr = platform::open(service, type, connection);
    if (!check_success(kr, condition::kr_is_zero, location)) return kr;
    return check(connection, "connect", location) ? platform::success : platform::no_memory;
}

platform::return_code open_channel(platform::service service, std::uint32_t type,
                                   service_channel& channel) {
    channel.service = std::move(service);
    if (!check(channel.service, condition::service)) return platform::not_found;
    return open_connection(channel.service, type, channel.connection);
}

platform::return_code open_channel(std::string_view service_name, service_channel& channel,
                                   on_failure on_missing) {
    platform::service service = find_service(service_name);
    if (!service && on_missing == on_failure::ignore) return platform::not_found;
    if (!service) explain_missing_service(service_name);
    return open_channel(std::move(service), 0, channel);
}

}  // namespace nrx
