// Every base operation, with each of its platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include <array>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/hid_driver.h"
#include "nrxctl/base/mca.h"
#include "nrxctl/base/named_property.h"
#include "nrxctl/base/profile_records.h"
#include "nrxctl/base/scalar_method.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/service_list.h"
#include "nrxctl/base/service_property.h"
#include "tests/base/base_host.h"

namespace tests {

namespace {

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    put_base_services(*host);
    put_service(*host, "profile", 32).set_report(0xd1, byte_list(96));
    const auto app = host->add({.name = "NRXApp"});
    host->add({.name = "client", .unit = std::make_shared<interface_driver>()}, app);
    host->add(
        {.name = "hid", .classes = {"KeltoNRXHIDDevice"}, .properties = {{"LocationID", 31}}});
    return host;
}

// Room for a reply, whole at each call.
platform::byte_span& room() {
    static std::array<std::uint8_t, 16> buffer;
    static platform::byte_span span;
    return span = buffer;
}

struct swept {
    std::function<void()> operation;
    std::function<bool(const fault&)> acceptable = is_told;
};

TEST(base_fault_sweep, channel_operations_connections_and_records) {
    const byte_list one{1};
    const std::vector<swept> operations{
        {[] { nrx::get_report("accel", 0xd0, room()); }},
        {[&] { nrx::set_report("accel", 0xd0, one); }},
        {[&] { nrx::send_command("accel", 0x20, one, room()); }},
        {[] { nrx::call_scalar_method("accel", {}); }},
        {[&] { nrx::set_named_property("accel", "gain", one); }},
        {[] { nrx::get_named_property("accel", "gain", room()); }},
        {[&] { nrx::call_hid_driver(one, room()); }},
        {[] { nrx::switch_mca(true); }},
        {[] { nrx::switch_mca(false); }},
        {[] { nrx::read_profile_records([](const nrx::profile_record&) {}); }},
        {[] { nrx::service_conn("NRXApp").open(); },
         [](const fault& fault) { return !fault.result.err.empty(); }},
        // Probing reports a failed open and nothing else.
        {[] { nrx::get_report_quiet("accel", 0xd0, room()); },
         [](const fault& fault) {
             return fault.result.err.empty() != fault.name.starts_with("open ");
         }},
        {[&] { nrx::send_command("31", 0x20, one, room(), nrx::expected_failure::is_silent); },
         [](const fault& fault) {
             return fault.result.err.empty() == fault.name.starts_with("call ");
         }},
    };
    for (const auto& [operation, acceptable] : operations)
        sweep_faults(make_host, operation, acceptable);
}

TEST(base_fault_sweep, discovery_and_properties) {
    std::string name;
    std::int32_t id = 0;
    const platform::property value(5);
    // A look-up without a prefix that finds no interface is reported; nothing else is.
    const auto missing_interface = [](const fault& one) {
        const bool last_try = one.name.find("IONameMatch = \"accel\"") != std::string::npos;
        return one.result.err.empty() != last_try;
    };
    // An answer of nothing is taken for what it is, if it is to a call that begins so.
    const auto told_but_for_nothing_of = [](const char* call) {
        return [call](const fault& one) {
            const bool is_nothing = one.name.starts_with(call) && one.how == failure::nothing;
            return is_nothing || one.result.err.find("Assertion failed") != std::string::npos;
        };
    };
    const std::vector<swept> operations{
        {[] { nrx::find_hid_device("accel"); }, missing_interface},
        {[&] { nrx::resolve_service_id("accel", id); }, missing_interface},
        {[&] { nrx::service_name_for_id(31, name); }, told_but_for_nothing_of("name of accel")},
        {[] { nrx::service_exists("31"); },
         [](const fault& one) {
             return one.result.err.empty() && one.result.out == "Service 31 can't be found\n";
         }},
        {[&] {
             const platform::service service = nrx::find_service("31");
             nrx::set_service_property(service, "service_id", &value);
             nrx::show_service_property(service, "service_id");
         },
         told_but_for_nothing_of("set property")},
        {[] { nrx::list_services(); },
         [&](const fault& one) {
             const bool is_shown = one.name.starts_with("property of") &&
                                   one.result.out.find(" no id\n") != std::string::npos;
             return is_shown || told_but_for_nothing_of("name of")(one) ||
                    told_but_for_nothing_of("all matches")(one);
         }},
    };
    for (const auto& [operation, acceptable] : operations)
        sweep_faults(make_host, operation, acceptable);
}

}  // namespace

}  // namespace tests
