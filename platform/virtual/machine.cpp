#include "platform/virtual/machine.h"

#include <algorithm>
#include <utility>

namespace platform::simulated {

entry_ref machine::add(entry description, const entry_ref& parent) {
    auto added = std::make_shared<entry>(std::move(description));
    if (parent) parent->children.push_back(added);
    entries_.push_back(added);
    for (const std::string& name : added->classes)
        by_class_[name].push_back(added);
    return added;
}

entry_ref machine::find(std::string_view name) const {
    const auto match = std::find_if(
        entries_.begin(), entries_.end(),
        [&](const entry_ref& candidate) { return candidate->present && candidate->name == name; });
    return match == entries_.end() ? nullptr : *match;
}

namespace {

void mark_removed(entry& removed) {
    removed.present = false;
    for (const entry_ref& child : removed.children) {
        mark_removed(*child);
    }
}

}  // namespace

void machine::remove(std::string_view name) {
    if (const entry_ref removed = find(name)) mark_removed(*removed);
}

const std::vector<entry_ref>& machine::entries_of_class(std::string_view name) const {
    static const std::vector<entry_ref> no_entries;
    const auto match = by_class_.find(name);
    return match == by_class_.end() ? no_entries : match->second;
}

void machine::release_object(handle_id id) {
    loop_.unschedule(id);
    handles_.erase(id);
}

void machine::fail_call(std::size_t n, failure kind) {
    failures_.push_back({calls_made_ + n, kind});
}

void machine::before_call(std::size_t n, std::function<void()> action) {
    actions_.push_back({calls_made_ + n, std::move(action)});
}

std::optional<failure> machine::count_call() {
    const std::size_t call = ++calls_made_;
    if (actions_.empty() && failures_.empty()) return std::nullopt;
    const auto actions = actions_;  // a copy, because an action may add another
    for (const injected_action& action : actions) {
        if (action.call == call) action.run();
    }
    const auto match =
        std::find_if(failures_.begin(), failures_.end(),
                     [&](const injected_failure& candidate) { return candidate.call == call; });
    return match == failures_.end() ? std::nullopt : std::optional(match->kind);
}

}  // namespace platform::simulated
