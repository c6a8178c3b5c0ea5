#include "nrxctl/base/service_conn.h"

#include "nrxctl/base/failure_report.h"

namespace nrx {

bool service_conn::open(bool quiet) {
    service_ = platform::first_match({{std::string(platform::name_match_key), name_}});
    if (!service_ && quiet) return false;
    if (!check(service_, "service")) return false;
    child_ = platform::first_child(service_, platform::service_plane);
    if (!check(child_, "child")) return false;
    const platform::return_code kr = platform::open(child_, 0, connection_);
    if (!check_success(kr, "kr == 0 ")) return false;
    return check(connection_, "connect");
}

}  // namespace nrx
