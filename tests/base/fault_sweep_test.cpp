// Every base operation with each of its platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include <array>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/mca.h"
#include "nrxctl/base/profile_record.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/services.h"
#include "tests/base/base_host.h"

namespace tests {

namespace {

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    add_base_services(*host);
    add_service(*host, "profile", 32).set_report(0xd1, byte_list(96));
    const auto app = host->add({.name = "NRXApp"});
    host->add({.name = "client", .driver = std::make_shared<interface_driver>()}, app);
    host->add(
        {.name = "hid", .classes = {"KeltoNRXHIDDevice"}, .properties = {{"LocationID", 31}}});
    return host;
}

// A buffer for a reply, complete at each call.
platform::byte_span& reply() {
    static std::array<std::uint8_t, 16> buffer;
    static platform::byte_span span;
    return span = buffer;
}

TEST(base_fault_sweep, every_failed_call_of_a_driver_is_reported) {
    const byte_list value{1};
    const std::string prefixed = "IONameMatch = \"WQR_";
    sweep_faults(make_host,
                 {{[] { nrx::get_report("accel", 0xd0, reply()); }, prefixed},
                  {[&] { nrx::set_report("accel", 0xd0, value); }, prefixed},
                  {[&] { nrx::send_command("accel", 0x20, value, reply()); }, prefixed},
                  {[] { nrx::call_scalar_method("accel", {}); }, prefixed},
                  {[&] { nrx::set_named_property("accel", "gain", value); }, prefixed},
                  {[] { nrx::get_named_property("accel", "gain", reply()); }, prefixed},
                  {[&] { nrx::call_hid_driver(value, reply()); }},
                  {[] { nrx::switch_mca(true); }, prefixed},
                  {[] { nrx::switch_mca(false); }, prefixed},
                  {[] { nrx::read_profile_records([](const nrx::profile_record&) {}); }, prefixed},
                  {[] { nrx::service_conn("NRXApp").open(); }},
                  {[&] { nrx::send_command("31", 0x20, value, reply(), nrx::on_failure::ignore); },
                   "^call "}});
    // Probing reports a failed open and nothing else.
    sweep_faults(
        make_host, [] { nrx::get_report_quiet("accel", 0xd0, reply()); },
        [](const fault& fault) {
            return fault.result.err.empty() != fault.name.starts_with("open ");
        });
}

TEST(base_fault_sweep, every_failed_call_of_discovery_is_reported) {
    std::string name;
    nrx::service_id id = 0;
    const platform::property value(5);
    // The lookup without a prefix that finds nothing is reported; nothing else is.
    const auto missing_interface = [](const fault& fault) {
        const bool is_last_lookup = fault.name.find("IONameMatch = \"accel\"") != std::string::npos;
        return fault.result.err.empty() != is_last_lookup;
    };
    // Reported, except for an empty result of a call that begins with this text.
    const auto reported_unless_empty = [](const char* call) {
        return [call](const fault& fault) {
            const bool is_empty =
                fault.name.starts_with(call) && fault.kind == failure::empty_result;
            return is_empty || fault.result.err.find("Assertion failed") != std::string::npos;
        };
    };
    struct row {
        std::function<void()> operation;
        std::function<bool(const fault&)> acceptable;
    };
    const std::vector<row> operations{
        {[] { nrx::find_hid_device("accel"); }, missing_interface},
        {[&] { nrx::resolve_service_id("accel", id); }, missing_interface},
        {[&] { nrx::service_name_for_id(31, name); }, reported_unless_empty("name of accel")},
        {[] { nrx::service_exists("31"); },
         [](const fault& fault) {
             return fault.result.err.empty() && fault.result.out == "Service 31 can't be found\n";
         }},
        {[&] {
             const platform::service service = nrx::find_service("31");
             nrx::set_service_property(service, "service_id", &value);
             nrx::show_service_property(service, "service_id");
         },
         reported_unless_empty("set property")},
        {[] { nrx::list_services(); },
         [&](const fault& fault) {
             const bool is_shown = fault.name.starts_with("property of") &&
                                   fault.result.out.find(" no id\n") != std::string::npos;
             return is_shown || reported_unless_empty("name of")(fault) ||
                    reported_unless_empty("all matches")(fault);
         }},
    };
    for (const auto& [operation, acceptable] : operations)
        sweep_faults(make_host, operation, acceptable);
}

}  // namespace

}  // namespace tests
