// The registry of the virtual host.

#include <algorithm>
#include <array>
#include <utility>

#include "platform/registry.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::entry;
using simulated::entry_ref;
using simulated::machine;
using simulated::service_object;

// --- matching ---

namespace {

bool has_property(const entry& candidate, std::string_view key, const property& expected) {
    const property* actual = candidate.properties.find(key);
    return actual != nullptr && same_value(*actual, expected);
}

bool has_class(const entry& candidate, std::string_view /*key*/, const property& expected) {
    const std::string* name = expected.text();
    return name != nullptr && std::find(candidate.classes.begin(), candidate.classes.end(),
                                        *name) != candidate.classes.end();
}

bool has_name(const entry& candidate, std::string_view /*key*/, const property& expected) {
    return expected.text() != nullptr && *expected.text() == candidate.name;
}

bool has_properties(const entry& candidate, std::string_view /*key*/, const property& expected) {
    const dictionary* properties = expected.entries();
    return properties != nullptr &&
           std::all_of(properties->entries().begin(), properties->entries().end(),
                       [&](const dictionary_entry& row) {
                           return has_property(candidate, row.key, row.value);
                       });
}

// Returns true if the device has any of the expected usage pairs.
bool has_usage_pair(const entry& candidate, std::string_view key, const property& expected) {
    const property* actual = candidate.properties.find(key);
    if (actual == nullptr || actual->items() == nullptr || expected.items() == nullptr)
        return false;
    const array& pairs = *actual->items();
    return std::find_first_of(pairs.begin(), pairs.end(), expected.items()->begin(),
                              expected.items()->end(), same_value) != pairs.end();
}

struct matching_rule {
    std::string_view key;
    bool (*holds)(const entry&, std::string_view key, const property& expected);
};

constexpr std::array matching_rules{
    matching_rule{provider_class_key, has_class},      matching_rule{name_match_key, has_name},
    matching_rule{property_match_key, has_properties}, matching_rule{location_id_key, has_property},
    matching_rule{usage_pairs_key, has_usage_pair},
};

bool holds(const entry& candidate, const dictionary_entry& condition) {
    const auto* rule =
        std::find_if(matching_rules.begin(), matching_rules.end(),
                     [&](const matching_rule& row) { return row.key == condition.key; });
    return rule != matching_rules.end() && rule->holds(candidate, condition.key, condition.value);
}

bool matches(const entry& candidate, const dictionary& matching) {
    const auto& conditions = matching.entries();
    return candidate.present && std::all_of(conditions.begin(), conditions.end(),
                                            [&](const dictionary_entry& condition) {
                                                return holds(candidate, condition);
                                            });
}

// The entries that can match, in registration order: those of the class, if one is given.
const std::vector<entry_ref>& candidates_for(const machine& host, const dictionary& matching) {
    const property* name = matching.find(provider_class_key);
    if (name == nullptr || name->text() == nullptr) return host.entries();
    return host.entries_of_class(*name->text());
}

}  // namespace

// --- lookup ---

void service_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event([&] { return "release " + log_name(host.provider<service_object>(id)); });
    host.release_object(id);
}

service first_match(const dictionary& matching) {
    machine& host = current_machine();
    const auto scope = host.begin_call([&] { return "first match " + describe(matching); });
    if (scope.fails()) return {};
    const auto& candidates = candidates_for(host, matching);
    const auto match =
        std::find_if(candidates.begin(), candidates.end(),
                     [&](const entry_ref& candidate) { return matches(*candidate, matching); });
    return match == candidates.end() ? service()
                                     : service(host.open_object(service_object{*match}));
}

return_code all_matches(const dictionary& matching, std::vector<service>& services) {
    machine& host = current_machine();
    const auto scope = host.begin_call([&] { return "all matches " + describe(matching); });
    if (scope.fails() && !scope.has_empty_result()) return scope.code();
    services.clear();
    if (scope.has_empty_result()) return success;
    for (const entry_ref& candidate : host.entries()) {
        if (matches(*candidate, matching))
            services.emplace_back(host.open_object(service_object{candidate}));
    }
    return success;
}

service first_child(const service& parent, std::string_view plane) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<service_object>(parent.id());
    const auto scope = host.begin_call([&] { return "first child of " + log_name(entry); });
    if (scope.fails()) return {};
    if (!entry || !entry->present || plane != service_plane) return {};
    const auto child = std::find_if(entry->children.begin(), entry->children.end(),
                                    [](const entry_ref& candidate) { return candidate->present; });
    return child == entry->children.end() ? service()
                                          : service(host.open_object(service_object{*child}));
}

// --- names and properties ---

return_code entry_name(const service& entry, std::string& name) {
    constexpr std::size_t max_name_length = 127;
    machine& host = current_machine();
    const entry_ref owner = host.provider<service_object>(entry.id());
    const auto scope = host.begin_call([&] { return "name of " + log_name(owner); });
    if (scope.has_empty_result()) name.clear();
    if (scope.fails()) return scope.code();
    if (!owner || !owner->present) return not_found;
    name = owner->name.substr(0, max_name_length);
    return success;
}

bool read_property(const service& entry, std::string_view name, property& value) {
    machine& host = current_machine();
    const entry_ref owner = host.provider<service_object>(entry.id());
    const auto scope =
        host.begin_call([&] { return "property of " + log_name(owner) + " " + std::string(name); });
    if (scope.fails() || !owner || !owner->present) return false;
    if (owner->refresh) owner->refresh(owner->properties);
    const property* current = owner->properties.find(name);
    if (current != nullptr) value = *current;
    return current != nullptr;
}

std::optional<property> read_property(const service& entry, std::string_view name) {
    property value(0);
    return read_property(entry, name, value) ? std::optional(std::move(value)) : std::nullopt;
}

return_code set_property(const service& entry, std::string_view name, const property& value) {
    machine& host = current_machine();
    const entry_ref owner = host.provider<service_object>(entry.id());
    const auto scope = host.begin_call([&] {
        return "set property of " + log_name(owner) + " " + std::string(name) + " = " +
               describe(value);
    });
    if (scope.fails()) return scope.code();
    if (!owner || !owner->present) return not_found;
    if (!owner->driver && !owner->hid) return unsupported;
    owner->properties.set(name, value);
    return success;
}

}  // namespace platform
