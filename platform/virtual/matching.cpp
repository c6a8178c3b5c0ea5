#include "platform/virtual/matching.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "platform/registry.h"

namespace platform::simulated {

namespace {

bool has_property(const entry& candidate, std::string_view key, const property& wanted) {
    const property* own = candidate.properties.find(key);
    return own != nullptr && same_value(*own, wanted);
}

bool has_class(const entry& candidate, std::string_view /*key*/, const property& wanted) {
    const std::string* name = wanted.text();
    return name != nullptr && std::find(candidate.classes.begin(), candidate.classes.end(),
                                        *name) != candidate.classes.end();
}

bool has_name(const entry& candidate, std::string_view /*key*/, const property& wanted) {
    return wanted.text() != nullptr && *wanted.text() == candidate.name;
}

bool has_properties(const entry& candidate, std::string_view /*key*/, const property& wanted) {
    const dictionary* all = wanted.entries();
    return all != nullptr && std::all_of(all->entries().begin(), all->entries().end(),
                                         [&](const dictionary_entry& one) {
                                             return has_property(candidate, one.key, one.value);
                                         });
}

// Any of the wanted usage pairs is among the device's own.
bool has_usage_pair(const entry& candidate, std::string_view key, const property& wanted) {
    const property* own = candidate.properties.find(key);
    if (own == nullptr || own->items() == nullptr || wanted.items() == nullptr) return false;
    const array& pairs = *own->items();
    return std::find_first_of(pairs.begin(), pairs.end(), wanted.items()->begin(),
                              wanted.items()->end(), same_value) != pairs.end();
}

struct rule {
    std::string_view key;
    bool (*holds)(const entry&, std::string_view key, const property& wanted);
};

constexpr std::array rules{
    rule{provider_class_key, has_class},      rule{name_match_key, has_name},
    rule{property_match_key, has_properties}, rule{location_id_key, has_property},
    rule{usage_pairs_key, has_usage_pair},
};

bool holds(const entry& candidate, const dictionary_entry& wanted) {
    const auto* row = std::find_if(rules.begin(), rules.end(),
                                   [&](const rule& known) { return known.key == wanted.key; });
    return row != rules.end() && row->holds(candidate, wanted.key, wanted.value);
}

}  // namespace

bool matches(const entry& candidate, const dictionary& matching) {
    const auto& wanted = matching.entries();
    return candidate.present &&
           std::all_of(wanted.begin(), wanted.end(),
                       [&](const dictionary_entry& key) { return holds(candidate, key); });
}

}  // namespace platform::simulated
