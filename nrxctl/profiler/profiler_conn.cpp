#include "nrxctl/profiler/profiler_conn.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/open_connection.h"

namespace nrx {

namespace {

constexpr std::uint32_t event_queue_memory = 0;
constexpr std::uint32_t event_notification = 0;

}  // namespace

bool profiler_conn::open(expected_failure missing) {
    service_ = platform::first_match(match_name(name_));
    if (!service_ && missing == expected_failure::is_silent) return false;
    if (!check(service_, "service")) return false;
    return open_connection(service_, 0, connection_) == platform::success;
}

bool profiler_conn::open_queue(expected_failure mapping) {
    const bool success = open();
    if (!check(success, "success")) return false;
    platform::return_code kr = platform::map_memory(connection_, event_queue_memory, queue_);
    if (!queue_ && mapping == expected_failure::is_silent) return false;
    if (!check_success(kr, "kr == 0 ")) return false;
    if (!check(queue_, "queue")) return false;
    port_ = platform::allocate_port();
    if (!check(port_, "rxPort")) return false;
    kr = platform::attach_port(connection_, event_notification, port_, 0);
    return check_success(kr, "kr == 0 ");
}

}  // namespace nrx
