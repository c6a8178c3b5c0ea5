#include "nrxctl/base/channel.h"

#include <utility>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/open_connection.h"
#include "nrxctl/base/service_discovery.h"

namespace nrx {

platform::return_code open_channel(platform::service found, std::uint32_t type, channel& opened) {
    opened.service = std::move(found);
    if (!check(opened.service, "service")) return platform::not_found;
    return open_connection(opened.service, type, opened.connect);
}

platform::return_code open_channel(std::string_view service_name, channel& opened,
                                   expected_failure missing) {
    platform::service found = find_service(service_name);
    if (!found && missing == expected_failure::is_silent) return platform::not_found;
    return open_channel(std::move(found), 0, opened);
}

}  // namespace nrx
