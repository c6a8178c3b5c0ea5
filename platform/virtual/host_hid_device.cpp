// HID device objects of the virtual host.

#include <algorithm>
#include <string>
#include <utility>

#include "platform/hid_device.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::failure;
using simulated::lent_hid_device;
using simulated::lent_service;
using simulated::machine;

namespace {

std::string name_of(machine& host, handle_id id) {
    const lent_hid_device* object = host.lent<lent_hid_device>(id);
    return object != nullptr ? object->provider->name : "nothing";
}

}  // namespace

void hid_device_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] { return "release hid device " + name_of(host, id); });
    host.take_back(id);
}

hid_device create_hid_device(const service& provider) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<lent_service>(provider.id());
    const auto how = host.begin_call([&] { return "create hid device " + name_of(entry); });
    if (how || !entry || !entry->present || !entry->hid) return {};
    return hid_device(host.lend(lent_hid_device{entry}));
}

return_code open(const hid_device& device) {
    machine& host = current_machine();
    const auto how =
        host.begin_call([&] { return "open hid device " + name_of(host, device.id()); });
    if (how) return code_of(*how);
    lent_hid_device* object = host.lent<lent_hid_device>(device.id());
    if (object == nullptr || !object->provider->present) return not_found;
    object->is_open = true;
    return success;
}

return_code feature_report(const hid_device& device, std::uint8_t report_id, byte_span& report) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] {
        return "feature report of " + name_of(host, device.id()) + " " + std::to_string(report_id) +
               " room " + std::to_string(report.size());
    });
    if (how) {
        if (*how == failure::nothing) report = {};
        return code_of(*how);
    }
    const lent_hid_device* object = host.lent<lent_hid_device>(device.id());
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
    const auto how =
        host.begin_call([&] { return "close hid device " + name_of(host, device.id()); });
    lent_hid_device* object = host.lent<lent_hid_device>(device.id());
    const bool was_open = object != nullptr && std::exchange(object->is_open, false);
    if (how) return code_of(*how);
    return was_open ? success : bad_argument;
}

}  // namespace platform
