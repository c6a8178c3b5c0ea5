#include "platform/virtual/machine.h"

#include <algorithm>
#include <utility>

namespace platform::simulated {

entry_ref machine::add(entry described, const entry_ref& parent) {
    auto added = std::make_shared<entry>(std::move(described));
    if (parent) parent->children.push_back(added);
    entries_.push_back(added);
    for (const std::string& name : added->classes)
        by_class_[name].push_back(added);
    return added;
}

entry_ref machine::find(std::string_view name) const {
    const auto found = std::find_if(entries_.begin(), entries_.end(), [&](const entry_ref& one) {
        return one->present && one->name == name;
    });
    return found == entries_.end() ? nullptr : *found;
}

namespace {

void take_away(entry& gone) {
    gone.present = false;
    for (const entry_ref& child : gone.children) {
        take_away(*child);
    }
}

}  // namespace

void machine::remove(std::string_view name) {
    if (const entry_ref gone = find(name)) take_away(*gone);
}

const std::vector<entry_ref>& machine::entries_of_class(std::string_view name) const {
    static const std::vector<entry_ref> none;
    const auto found = by_class_.find(name);
    return found == by_class_.end() ? none : found->second;
}

void machine::take_back(handle_id id) {
    loop_.unschedule(id);
    handles_.take_back(id);
}

void machine::fail_call(std::size_t n, failure how) {
    failures_.push_back({calls_made_ + n, how});
}

void machine::before_call(std::size_t n, std::function<void()> action) {
    actions_.push_back({calls_made_ + n, std::move(action)});
}

std::optional<failure> machine::count_call() {
    const std::size_t call = ++calls_made_;
    if (actions_.empty() && failures_.empty()) return std::nullopt;
    const auto planned_actions = actions_;  // a copy, because an action may plan another
    for (const planned_action& planned : planned_actions) {
        if (planned.call == call) planned.run();
    }
    const auto planned =
        std::find_if(failures_.begin(), failures_.end(),
                     [&](const planned_failure& failing) { return failing.call == call; });
    return planned == failures_.end() ? std::nullopt : std::optional(planned->how);
}

}  // namespace platform::simulated
