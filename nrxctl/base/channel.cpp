#include "nrxctl/base/channel.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/service_discovery.h"

namespace nrx {

platform::return_code open_channel(std::string_view service_name, missing_service missing,
                                   channel& opened) {
    opened.service = find_service(service_name);
    if (!opened.service && missing == missing_service::is_silent) return platform::not_found;
    if (!check(opened.service, "service")) return platform::not_found;
    const platform::return_code kr = platform::open(opened.service, 0, opened.connect);
    if (!check_success(kr, "kr == 0 ")) return kr;
    if (!check(opened.connect, "connect")) return platform::no_memory;
    return platform::success;
}

}  // namespace nrx
