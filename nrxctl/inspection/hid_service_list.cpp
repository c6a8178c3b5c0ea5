#include "nrxctl/inspection/hid_service_list.h"

#include <cstdint>
#include <string>
#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/text_line.h"
#include "platform/registry.h"

namespace nrx {

namespace {

constexpr std::string_view hid_interface_class = "KeltoNRXHIDInterface";
constexpr std::string_view no_list = "Can't enumerate HID services";

void print_names() {
    std::vector<platform::service> services;
    const auto listed =
        platform::all_matches(platform::matching_class(hid_interface_class), services);
    if (!check(listed == platform::success, "kr == 0")) return print_line(no_list);
    text_line line;
    line.text("Available HID services: ");
    for (platform::service& service : services) {
        std::string name;
        const auto named = platform::entry_name(service, name);
        if (!check(named == platform::success, "kr == 0")) {
            return print_line(line.text(no_list).view());
        }
        line.text(name).text(" ");
        service.reset();
    }
    print_line(line.view());
}

void print_matching(std::string_view name) {
    const platform::dictionary matching = match_service_name(name);
    const platform::service found = platform::first_match(matching);
    text_line line;
    line.text("Matching ").text(name);
    line.text(" [0x").hex(reinterpret_cast<std::uintptr_t>(&matching));
    print_line(line.text(", ").number(found.id()).text("]").view());
}

}  // namespace

void print_hid_services(std::string_view service_name) {
    print_names();
    print_matching(prefixed_name(service_name));
    print_matching(service_name);
    print_line("\n\n");
}

}  // namespace nrx
