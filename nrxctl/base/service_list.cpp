#include "nrxctl/base/service_list.h"

#include <string>
#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "platform/registry.h"

namespace nrx {

namespace {

platform::return_code list_service(const platform::service& service) {
    constexpr std::size_t name_width = 24;
    std::string name;
    const platform::return_code kr = platform::entry_name(service, name);
    if (!check_success(kr, "kr == 0 ")) return kr;
    const auto id = platform::read_property(service, service_id_key);
    text_line line;
    line.left(name, name_width).text(" ");
    if (id && id->number()) {
        line.text("0x").hex(static_cast<std::uint32_t>(*id->number()));
    } else {
        line.text("no id");
    }
    print_line(line.view());
    return platform::success;
}

}  // namespace

platform::return_code list_services() {
    std::vector<platform::service> services;
    const platform::return_code kr =
        platform::all_matches(platform::matching_class(interface_class), services);
    if (!check_success(kr, "kr == 0 ")) return kr;
    platform::return_code result = platform::success;
    for (const platform::service& service : services) {
        const platform::return_code listed = list_service(service);
        if (listed != platform::success) result = listed;
    }
    return result;
}

}  // namespace nrx
