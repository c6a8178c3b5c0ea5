#include "nrxctl/inspection/hid_event_watch.h"

#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/inspection/hid_events.h"
#include "nrxctl/inspection/hid_statistics.h"
#include "platform/hid_event_client.h"
#include "platform/run_loop.h"

namespace nrx {

platform::return_code watch_hid_events(std::optional<std::chrono::seconds> duration) {
    const limited_watch limited;
    const platform::hid_event_client client = platform::create_hid_event_client();
    if (!check(client, "client")) return platform::not_found;
    platform::return_code kr = platform::set_event_callback(
        client, [](const platform::hid_event& event) { print_hid_event(event, {}); });
    if (!check_success(kr, condition::kr_is_zero)) return kr;
    kr = platform::set_reset_callback(client, [&] { reset_callback(client, nullptr); });
    if (!check_success(kr, condition::kr_is_zero)) return kr;
    kr = platform::set_statistics_callback(client, stats_callback);
    if (!check_success(kr, condition::kr_is_zero)) return kr;
    kr = platform::schedule_on_loop(client);
    if (!check_success(kr, condition::kr_is_zero)) return kr;
    flush_output();
    kr = duration ? platform::run_loop_for(*duration) : platform::run_loop();
    check_success(kr, condition::kr_is_zero);
    return kr;
}

}  // namespace nrx
