// Plug-ins of HID devices, and their interfaces, on the virtual host.

#include <memory>
#include <string>
#include <utility>

#include "platform/hid_plugin.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::lent_hid_interface;
using simulated::lent_hid_plugin;
using simulated::lent_service;
using simulated::machine;
using simulated::record_listener;

namespace {

std::string name_of(const std::shared_ptr<record_listener>& listener) {
    return listener ? listener->provider->name : "nothing";
}

std::shared_ptr<record_listener> listener_of(machine& host, handle_id id) {
    const auto* lent = host.lent<lent_hid_interface>(id);
    return lent == nullptr ? nullptr : lent->listener;
}

bool is_there(const std::shared_ptr<record_listener>& listener) {
    return listener && listener->provider->present;
}

}  // namespace

void hid_plugin_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] { return "destroy hid plugin " + name_of(host.provider<lent_hid_plugin>(id)); });
    host.take_back(id);
}

void hid_interface_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] { return "release hid interface " + name_of(listener_of(host, id)); });
    host.take_back(id);
}

hid_plugin create_hid_plugin(const service& provider) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<lent_service>(provider.id());
    const auto how = host.begin_call([&] { return "create hid plugin " + name_of(entry); });
    if (how || !entry || !entry->present || !entry->records) return {};
    return hid_plugin(host.lend(lent_hid_plugin{entry}));
}

hid_interface query_hid_interface(const hid_plugin& plugin) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<lent_hid_plugin>(plugin.id());
    const auto how = host.begin_call([&] { return "query hid interface " + name_of(provider); });
    if (how || !provider || !provider->present) return {};
    return hid_interface(
        host.lend(lent_hid_interface{std::make_shared<record_listener>(provider)}));
}

return_code schedule_on_loop(const hid_interface& device) {
    machine& host = current_machine();
    const auto listener = listener_of(host, device.id());
    const auto how = host.begin_call([&] { return "schedule hid interface " + name_of(listener); });
    if (how) return code_of(*how);
    if (!is_there(listener)) return not_found;
    host.loop().schedule(device.id(), listener);
    return success;
}

return_code set_record_callback(const hid_interface& device, record_callback callback) {
    machine& host = current_machine();
    const auto listener = listener_of(host, device.id());
    const auto how = host.begin_call([&] { return "set record callback " + name_of(listener); });
    if (how) return code_of(*how);
    if (!is_there(listener)) return not_found;
    listener->on_record = std::move(callback);
    return success;
}

return_code set_mode(const hid_interface& device, std::int32_t service_id, std::uint32_t mode) {
    machine& host = current_machine();
    const auto listener = listener_of(host, device.id());
    const auto how = host.begin_call([&] {
        return "set mode " + name_of(listener) + " service " + std::to_string(service_id) +
               " mode " + std::to_string(mode);
    });
    if (how) return code_of(*how);
    if (!is_there(listener)) return not_found;
    return listener->provider->records->set_mode(service_id, mode);
}

}  // namespace platform
