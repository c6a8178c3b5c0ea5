#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/replay_app.h"
#include "nrxctl/replay/subcommands.h"

namespace nrx::replay {

namespace {

void print_refusal(std::string_view service, std::string_view refusal) {
    print_line(text_line().text("Service ").text(service).text(refusal).view());
}

void unload_service(const service_conn& conn, std::string_view service) {
    std::int32_t id = 0;
    if (!resolve_service_id(service, id)) {
        print_refusal(service, " not found");
        return;
    }
    std::vector<std::uint8_t> request;
    append_words(request, {static_cast<std::uint32_t>(id)});
    platform::call_outputs nothing;
    const platform::return_code kr =
        platform::call(conn.connection(), replay_app::unload_method, {{}, request}, nothing);
    if (kr != platform::success) print_refusal(service, " can't be unloaded");
}

}  // namespace

void unload(argument_words& words) {
    auto service = words.take();
    if (!check(service, "argc > optind")) return;
    if (!replay_is_enabled()) return;
    service_conn conn(replay_app::service_name);
    const bool success = conn.open();
    if (!check(success, "success")) return;
    for (; service; service = words.take())
        unload_service(conn, *service);
}

}  // namespace nrx::replay
