#include "nrxctl/base/service_conn.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/open_connection.h"

namespace nrx {

bool service_conn::open(bool quiet) {
    service_ = platform::first_match({{std::string(platform::name_match_key), name_}});
    if (!service_ && quiet) return false;
    if (!check(service_, "service")) return false;
    child_ = platform::first_child(service_, platform::service_plane);
    if (!check(child_, "child")) return false;
    return open_connection(child_, 0, connection_) == platform::success;
}

}  // namespace nrx
