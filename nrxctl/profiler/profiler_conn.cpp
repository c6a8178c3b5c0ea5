#include "nrxctl/profiler/profiler_conn.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/open_connection.h"

namespace nrx {

namespace {

constexpr std::uint32_t event_queue_memory = 0;
constexpr std::uint32_t event_notification = 0;

}  // namespace

bool profiler_conn::open(presence driver) {
    service_ = platform::first_match({{std::string(platform::name_match_key), name_}});
    if (!service_ && driver == presence::is_optional) return false;
    if (!check(service_, "service")) return false;
    return open_connection(service_, 0, connection_) == platform::success;
}

bool profiler_conn::open_queue(presence mapping) {
    const bool success = open(presence::is_required);
    if (!check(success, "success")) return false;
    platform::return_code kr = platform::map_memory(connection_, event_queue_memory, queue_);
    if (!queue_ && mapping == presence::is_optional) return false;
    if (!check_success(kr, "kr == 0 ")) return false;
    if (!check(queue_, "queue")) return false;
    port_ = platform::allocate_port();
    if (!check(port_, "rxPort")) return false;
    kr = platform::attach_port(connection_, event_notification, port_, 0);
    return check_success(kr, "kr == 0 ");
}

}  // namespace nrx
