// HID devices, plug-ins and event clients of the virtual host.

#include <algorithm>
#include <iterator>
#include <memory>
#include <string>
#include <utility>

#include "platform/hid_device.h"
#include "platform/hid_event_client.h"
#include "platform/hid_plugin.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::event_listener;
using simulated::hid_device_object;
using simulated::hid_event_client_object;
using simulated::hid_interface_object;
using simulated::hid_plugin_object;
using simulated::hid_service_list_object;
using simulated::machine;
using simulated::record_listener;
using simulated::service_object;

// --- devices ---

namespace {

std::string device_name(machine& host, handle_id id) {
    return log_name(host.provider<hid_device_object>(id));
}

}  // namespace

void hid_device_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event([&] { return "release hid device " + device_name(host, id); });
    host.release_object(id);
}

hid_device create_hid_device(const service& provider) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<service_object>(provider.id());
    const auto scope = host.begin_call([&] { return "create hid device " + log_name(entry); });
    if (scope.fails() || !entry || !entry->present || !entry->hid) return {};
    return hid_device(host.open_object(hid_device_object{entry}));
}

return_code open(const hid_device& device) {
    machine& host = current_machine();
    const auto scope =
        host.begin_call([&] { return "open hid device " + device_name(host, device.id()); });
    if (scope.fails()) return scope.code();
    auto* object = host.find_object<hid_device_object>(device.id());
    if (object == nullptr || !object->provider->present) return not_found;
    object->is_open = true;
    return success;
}

return_code read_feature_report(const hid_device& device, std::uint8_t report_id,
                                byte_span& report) {
    machine& host = current_machine();
    const auto scope = host.begin_call([&] {
        return "feature report of " + device_name(host, device.id()) + " " +
               std::to_string(report_id) + " capacity " + std::to_string(report.size());
    });
    if (scope.has_empty_result()) report = {};
    if (scope.fails()) return scope.code();
    const auto* object = host.find_object<hid_device_object>(device.id());
    if (object == nullptr || !object->provider->present) return not_found;
    if (!object->is_open) return bad_argument;
    const auto* bytes = object->provider->hid->feature_report(report_id);
    if (bytes == nullptr) return unsupported;
    if (bytes->size() > report.size()) return bad_argument;
    std::copy(bytes->begin(), bytes->end(), report.begin());
    report = report.first(bytes->size());
    return success;
}

return_code close(const hid_device& device) {
    machine& host = current_machine();
    const auto scope =
        host.begin_call([&] { return "close hid device " + device_name(host, device.id()); });
    auto* object = host.find_object<hid_device_object>(device.id());
    const bool was_open = object != nullptr && std::exchange(object->is_open, false);
    if (scope.fails()) return scope.code();
    return was_open ? success : bad_argument;
}

// --- plug-ins and their interfaces ---

namespace {

std::shared_ptr<record_listener> record_listener_of(machine& host, handle_id id) {
    const auto* object = host.find_object<hid_interface_object>(id);
    return object == nullptr ? nullptr : object->listener;
}

std::string interface_name(const std::shared_ptr<record_listener>& listener) {
    return log_name(listener ? listener->provider : nullptr);
}

bool is_present(const std::shared_ptr<record_listener>& listener) {
    return listener && listener->provider->present;
}

}  // namespace

void hid_plugin_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event(
        [&] { return "destroy hid plugin " + log_name(host.provider<hid_plugin_object>(id)); });
    host.release_object(id);
}

void hid_interface_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event(
        [&] { return "release hid interface " + interface_name(record_listener_of(host, id)); });
    host.release_object(id);
}

hid_plugin create_hid_plugin(const service& provider) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<service_object>(provider.id());
    const auto scope = host.begin_call([&] { return "create hid plugin " + log_name(entry); });
    if (scope.fails() || !entry || !entry->present || !entry->records) return {};
    return hid_plugin(host.open_object(hid_plugin_object{entry}));
}

hid_interface query_hid_interface(const hid_plugin& plugin) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<hid_plugin_object>(plugin.id());
    const auto scope = host.begin_call([&] { return "query hid interface " + log_name(provider); });
    if (scope.fails() || !provider || !provider->present) return {};
    return hid_interface(
        host.open_object(hid_interface_object{std::make_shared<record_listener>(provider)}));
}

return_code schedule_on_loop(const hid_interface& device) {
    machine& host = current_machine();
    const auto listener = record_listener_of(host, device.id());
    const auto scope =
        host.begin_call([&] { return "schedule hid interface " + interface_name(listener); });
    if (scope.fails()) return scope.code();
    if (!is_present(listener)) return not_found;
    host.loop().schedule(device.id(), listener);
    return success;
}

return_code set_record_callback(const hid_interface& device, record_callback callback) {
    machine& host = current_machine();
    const auto listener = record_listener_of(host, device.id());
    const auto scope =
        host.begin_call([&] { return "set record callback " + interface_name(listener); });
    if (scope.fails()) return scope.code();
    if (!is_present(listener)) return not_found;
    listener->on_record = std::move(callback);
    return success;
}

return_code set_mode(const hid_interface& device, std::int32_t service_id, std::uint32_t mode) {
    machine& host = current_machine();
    const auto listener = record_listener_of(host, device.id());
    const auto scope = host.begin_call([&] {
        return "set mode " + interface_name(listener) + " service " + std::to_string(service_id) +
               " mode " + std::to_string(mode);
    });
    if (scope.fails()) return scope.code();
    if (!is_present(listener)) return not_found;
    return listener->provider->records->set_mode(service_id, mode);
}

// --- event clients ---

namespace {

std::shared_ptr<event_listener> event_listener_of(machine& host, handle_id id) {
    const auto* object = host.find_object<hid_event_client_object>(id);
    return object == nullptr ? nullptr : object->listener;
}

template <class Callback>
return_code set_callback(const hid_event_client& client, const char* call_name,
                         Callback event_listener::*member, Callback callback) {
    machine& host = current_machine();
    const auto scope = host.begin_call([&] { return std::string(call_name); });
    if (scope.fails()) return scope.code();
    const auto listener = event_listener_of(host, client.id());
    if (!listener) return not_found;
    *listener.*member = std::move(callback);
    return success;
}

std::vector<entry_ref> present_hid_services(const machine& host) {
    std::vector<entry_ref> services;
    std::copy_if(host.entries().begin(), host.entries().end(), std::back_inserter(services),
                 [](const entry_ref& entry) { return entry->present && entry->hid != nullptr; });
    return services;
}

}  // namespace

void hid_event_client_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event([] { return std::string("release hid event client"); });
    host.release_object(id);
}

void hid_service_list_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event([&] {
        const auto* list = host.find_object<hid_service_list_object>(id);
        return "release list of " + std::to_string(list == nullptr ? 0 : list->services.size()) +
               " hid services";
    });
    host.release_object(id);
}

hid_event_client create_hid_event_client() {
    machine& host = current_machine();
    const auto scope = host.begin_call([] { return std::string("create hid event client"); });
    if (scope.fails() || !host.hid_events()) return {};
    return hid_event_client(host.open_object(
        hid_event_client_object{std::make_shared<event_listener>(host.hid_events()())}));
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
    const auto scope = host.begin_call([] { return std::string("schedule hid event client"); });
    if (scope.fails()) return scope.code();
    const auto listener = event_listener_of(host, client.id());
    if (!listener) return not_found;
    host.loop().schedule(client.id(), listener);
    return success;
}

hid_service_list list_hid_services(const hid_event_client& client) {
    machine& host = current_machine();
    const auto scope = host.begin_call([] { return std::string("services of hid event client"); });
    if (scope.fails() || !event_listener_of(host, client.id())) return {};
    return hid_service_list(host.open_object(hid_service_list_object{present_hid_services(host)}));
}

}  // namespace platform
