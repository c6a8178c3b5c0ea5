// Clients of the virtual host's HID event system.

#include <algorithm>
#include <iterator>
#include <string>
#include <utility>

#include "platform/hid_event_client.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::event_listener;
using simulated::lent_hid_event_client;
using simulated::lent_hid_services;
using simulated::machine;

namespace {

std::shared_ptr<event_listener> listener_of(machine& host, handle_id id) {
    const auto* lent = host.lent<lent_hid_event_client>(id);
    return lent == nullptr ? nullptr : lent->listener;
}

// Sets one callback of a client.
template <class Callback>
return_code set_callback(const hid_event_client& client, const char* call_name,
                         Callback event_listener::*member, Callback callback) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] { return std::string(call_name); });
    if (how) return code_of(*how);
    const auto listener = listener_of(host, client.id());
    if (!listener) return not_found;
    *listener.*member = std::move(callback);
    return success;
}

std::vector<entry_ref> hid_services(const machine& host) {
    std::vector<entry_ref> found;
    std::copy_if(host.entries().begin(), host.entries().end(), std::back_inserter(found),
                 [](const entry_ref& one) { return one->present && one->hid != nullptr; });
    return found;
}

}  // namespace

void hid_event_client_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([] { return std::string("release hid event client"); });
    host.take_back(id);
}

void hid_service_list_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] {
        const auto* list = host.lent<lent_hid_services>(id);
        return "release list of " + std::to_string(list == nullptr ? 0 : list->services.size()) +
               " hid services";
    });
    host.take_back(id);
}

hid_event_client create_hid_event_client() {
    machine& host = current_machine();
    const auto how = host.begin_call([] { return std::string("create hid event client"); });
    if (how || !host.hid_events()) return {};
    return hid_event_client(
        host.lend(lent_hid_event_client{std::make_shared<event_listener>(host.hid_events()())}));
}

return_code set_event_callback(const hid_event_client& client,
                               std::function<void(const hid_event& event)> callback) {
    return set_callback(client, "set event callback", &event_listener::on_event,
                        std::move(callback));
}

return_code set_reset_callback(const hid_event_client& client, std::function<void()> callback) {
    return set_callback(client, "set reset callback", &event_listener::on_reset,
                        std::move(callback));
}

return_code set_statistics_callback(const hid_event_client& client,
                                    std::function<void(byte_view records)> callback) {
    return set_callback(client, "set statistics callback", &event_listener::on_statistics,
                        std::move(callback));
}

return_code schedule_on_loop(const hid_event_client& client) {
    machine& host = current_machine();
    const auto how = host.begin_call([] { return std::string("schedule hid event client"); });
    if (how) return code_of(*how);
    const auto listener = listener_of(host, client.id());
    if (!listener) return not_found;
    host.loop().schedule(client.id(), listener);
    return success;
}

hid_service_list services_of(const hid_event_client& client) {
    machine& host = current_machine();
    const auto how = host.begin_call([] { return std::string("services of hid event client"); });
    if (how || !listener_of(host, client.id())) return {};
    return hid_service_list(host.lend(lent_hid_services{hid_services(host)}));
}

}  // namespace platform
