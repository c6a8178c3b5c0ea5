#include "nrxctl/base/service_conn.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/open_connection.h"

namespace nrx {

bool service_conn::open(expected_failure missing) {
    service_ = platform::first_match(match_name(name_));
    if (!service_ && missing == expected_failure::is_silent) return false;
    if (!check(service_, "service")) return false;
    child_ = platform::first_child(service_, platform::service_plane);
    if (!check(child_, "child")) return false;
    return open_connection(child_, 0, connection_) == platform::success;
}

}  // namespace nrx
