// Every base operation, with each of its platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include <array>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/profile_records.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/service_property.h"
#include "tests/support/device_test.h"

namespace {

using tests::byte_list;
using tests::failure;
using tests::fault;
using tests::sweep_faults;

std::unique_ptr<tests::machine> make_host() {
    auto host = std::make_unique<tests::machine>();
    auto& accel = tests::put_service(*host, "accel", 31);
    accel.set_report(0xd0, {1, 2, 3});
    accel.set_command(0x20, [](platform::byte_view, byte_list& reply) {
        reply = {1};
        return platform::success;
    });
    tests::put_service(*host, "profile", 32).set_report(0xd1, byte_list(96));
    const auto app = host->add({.name = "NRXApp"});
    host->add({.name = "client", .unit = std::make_shared<tests::interface_driver>()}, app);
    host->add(
        {.name = "hid", .classes = {"KeltoNRXHIDDevice"}, .properties = {{"LocationID", 31}}});
    return host;
}

std::array<std::uint8_t, 16> buffer;

// The look-up of the prefixed name finds nothing in a good run either; an empty reply is no
// failure.
bool reported_or_harmless(const fault& one) {
    return one.call == 1 || one.how == failure::nothing || !one.result.err.empty();
}

bool silent(const fault& one) {
    return one.result.err.empty() || one.call >= 3;
}

TEST(base_fault_sweep, reports_of_the_command_channel) {
    sweep_faults(
        make_host,
        [] {
            platform::byte_span room = buffer;
            nrx::get_report("accel", 0xd0, room);
        },
        reported_or_harmless);
    sweep_faults(
        make_host, [] { nrx::set_report("accel", 0xd0, byte_list{1}); }, reported_or_harmless);
    sweep_faults(
        make_host,
        [] {
            platform::byte_span room = buffer;
            nrx::send_command("accel", 0x20, byte_list{1}, room);
        },
        reported_or_harmless);
    sweep_faults(
        make_host,
        [] {
            platform::byte_span room = buffer;
            nrx::get_report_quiet("accel", 0xd0, room);
        },
        silent);
}

TEST(base_fault_sweep, connections_and_records) {
    sweep_faults(make_host, [] { nrx::service_conn("NRXApp").open(false); });
    sweep_faults(
        make_host, [] { nrx::read_profile_records([](const nrx::profile_record&) {}); },
        [](const fault& one) {
            return (one.call - 1) % 4 == 0 || one.how == failure::nothing ||
                   !one.result.err.empty();
        });
}

TEST(base_fault_sweep, discovery_and_properties) {
    std::string name;
    std::int32_t id = 0;
    const auto any = [](const fault&) { return true; };
    sweep_faults(
        make_host, [&] { nrx::find_hid_device("accel"); }, any);
    sweep_faults(
        make_host, [&] { nrx::resolve_service_id("accel", id); }, any);
    sweep_faults(
        make_host, [&] { nrx::service_name_for_id(31, name); }, reported_or_harmless);
    const platform::property value(5);
    sweep_faults(
        make_host,
        [&] {
            const platform::service service = nrx::find_service("31");
            if (service) nrx::set_service_property(service, "service_id", &value);
            if (service) nrx::show_service_property(service, "service_id");
        },
        [](const fault& one) {
            return one.call == 1 || one.how == failure::nothing || !one.result.err.empty();
        });
}

}  // namespace
