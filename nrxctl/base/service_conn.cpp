#include "nrxctl/base/service_conn.h"

#include "nrxctl/base/channel.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/services.h"

namespace nrx {

bool service_conn::open(on_failure on_missing) {
    service_ = platform::first_match(match_name(name_));
    if (!service_ && on_missing == on_failure::ignore) return false;
    if (!check(service_, condition::service)) return false;
    child_ = platform::first_child(service_, platform::service_plane);
    if (!check(child_, condition::child)) return false;
    return open_connection(child_, 0, connection_) == platform::success;
}

}  // namespace nrx
