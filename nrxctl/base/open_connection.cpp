#include "nrxctl/base/open_connection.h"

#include "nrxctl/base/failure_report.h"

namespace nrx {

platform::return_code open_connection(const platform::service& service, std::uint32_t type,
                                      platform::connection& connect, source_place place) {
    const platform::return_code kr = platform::open(service, type, connect);
    if (!check_success(kr, "kr == 0 ", place)) return kr;
    return check(connect, "connect", place) ? platform::success : platform::no_memory;
}

}  // namespace nrx
