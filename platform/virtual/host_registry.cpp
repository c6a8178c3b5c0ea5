// The registry of the virtual host.

#include <algorithm>
#include <utility>

#include "platform/registry.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/matching.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::failure;
using simulated::lent_service;
using simulated::machine;

namespace {

constexpr std::size_t longest_entry_name = 127;

// The entries that a look-up has to consider, in registration order.
const std::vector<entry_ref>& possible_matches(const machine& host, const dictionary& matching) {
    const property* name = matching.find(provider_class_key);
    if (name == nullptr || name->text() == nullptr) return host.entries();
    return host.entries_of_class(*name->text());
}

}  // namespace

void service_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] { return "release " + name_of(host.provider<lent_service>(id)); });
    host.take_back(id);
}

service first_match(const dictionary& matching) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] { return "first match " + describe(matching); });
    if (how) return {};
    const auto& candidates = possible_matches(host, matching);
    const auto found = std::find_if(
        candidates.begin(), candidates.end(),
        [&](const entry_ref& candidate) { return simulated::matches(*candidate, matching); });
    return found == candidates.end() ? service() : service(host.lend(lent_service{*found}));
}

return_code all_matches(const dictionary& matching, std::vector<service>& found) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] { return "all matches " + describe(matching); });
    if (how && *how != failure::nothing) return code_of(*how);
    found.clear();
    if (how) return success;
    for (const entry_ref& candidate : host.entries()) {
        if (simulated::matches(*candidate, matching))
            found.emplace_back(host.lend(lent_service{candidate}));
    }
    return success;
}

service first_child(const service& parent, std::string_view plane) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<lent_service>(parent.id());
    const auto how = host.begin_call([&] { return "first child of " + name_of(entry); });
    if (how) return {};
    if (!entry || !entry->present || plane != service_plane) return {};
    const auto child = std::find_if(entry->children.begin(), entry->children.end(),
                                    [](const entry_ref& one) { return one->present; });
    return child == entry->children.end() ? service() : service(host.lend(lent_service{*child}));
}

return_code entry_name(const service& entry, std::string& name) {
    machine& host = current_machine();
    const entry_ref named = host.provider<lent_service>(entry.id());
    const auto how = host.begin_call([&] { return "name of " + name_of(named); });
    if (how) {
        if (*how == failure::nothing) name.clear();
        return code_of(*how);
    }
    if (!named || !named->present) return not_found;
    name = named->name.substr(0, longest_entry_name);
    return success;
}

bool read_property(const service& entry, std::string_view name, property& value) {
    machine& host = current_machine();
    const entry_ref owner = host.provider<lent_service>(entry.id());
    const auto how =
        host.begin_call([&] { return "property of " + name_of(owner) + " " + std::string(name); });
    if (how) return false;
    if (!owner || !owner->present) return false;
    if (owner->refresh) owner->refresh(owner->properties);
    const property* own = owner->properties.find(name);
    if (own != nullptr) value = *own;
    return own != nullptr;
}

std::optional<property> read_property(const service& entry, std::string_view name) {
    property value(0);
    return read_property(entry, name, value) ? std::optional(std::move(value)) : std::nullopt;
}

return_code set_property(const service& entry, std::string_view name, const property& value) {
    machine& host = current_machine();
    const entry_ref owner = host.provider<lent_service>(entry.id());
    const auto how = host.begin_call([&] {
        return "set property of " + name_of(owner) + " " + std::string(name) + " = " +
               describe(value);
    });
    if (how) return code_of(*how);
    if (!owner || !owner->present) return not_found;
    if (!owner->unit && !owner->hid) return unsupported;
    owner->properties.set(name, value);
    return success;
}

}  // namespace platform
