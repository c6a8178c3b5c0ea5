#include "platform/virtual/machine.h"

#include <algorithm>
#include <utility>

#include "platform/virtual/wrist_device.h"

namespace platform::simulated {

entry_ref machine::add(entry described, const entry_ref& parent) {
    auto added = std::make_shared<entry>(std::move(described));
    if (parent) parent->children.push_back(added);
    entries_.push_back(added);
    return added;
}

entry_ref machine::find(std::string_view name) const {
    const auto found = std::find_if(entries_.begin(), entries_.end(), [&](const entry_ref& one) {
        return one->present && one->name == name;
    });
    return found == entries_.end() ? nullptr : *found;
}

void machine::remove(std::string_view name) {
    if (const entry_ref gone = find(name)) gone->present = false;
}

handle_id machine::lend_service(entry_ref provider) {
    services_.emplace(++last_handle_, std::move(provider));
    return last_handle_;
}

handle_id machine::lend_connection(entry_ref provider) {
    connections_.emplace(++last_handle_, std::move(provider));
    return last_handle_;
}

handle_id machine::lend_hid_device(entry_ref provider) {
    hid_devices_.emplace(++last_handle_, hid_object{std::move(provider)});
    return last_handle_;
}

entry_ref machine::service(handle_id id) const {
    const auto found = services_.find(id);
    return found == services_.end() ? nullptr : found->second;
}

entry_ref machine::connection(handle_id id) const {
    const auto found = connections_.find(id);
    return found == connections_.end() ? nullptr : found->second;
}

hid_object* machine::hid_device(handle_id id) {
    const auto found = hid_devices_.find(id);
    return found == hid_devices_.end() ? nullptr : &found->second;
}

void machine::take_back(handle_id id) {
    services_.erase(id);
    connections_.erase(id);
    hid_devices_.erase(id);
}

std::size_t machine::open_handles() const {
    const auto opened = std::count_if(hid_devices_.begin(), hid_devices_.end(),
                                      [](const auto& one) { return one.second.is_open; });
    return services_.size() + connections_.size() + hid_devices_.size() +
           static_cast<std::size_t>(opened);
}

void machine::fail_call(std::size_t n, failure how) {
    failures_.push_back({calls_made_ + n, how});
}

void machine::before_call(std::size_t n, std::function<void()> action) {
    actions_.push_back({calls_made_ + n, std::move(action)});
}

std::optional<failure> machine::count_call() {
    ++calls_made_;
    for (const planned_action& planned : actions_) {
        if (planned.call == calls_made_) planned.run();
    }
    for (const planned_failure& planned : failures_) {
        if (planned.call == calls_made_) return planned.how;
    }
    return std::nullopt;
}

namespace {

machine* installed = nullptr;

}  // namespace

machine& current_machine() {
    if (installed != nullptr) return *installed;
    static const std::unique_ptr<machine> embedded = make_wrist_device();
    return *embedded;
}

installed_machine::installed_machine(machine& device)
    : previous_(std::exchange(installed, &device)) {
}

installed_machine::~installed_machine() {
    installed = previous_;
}

}  // namespace platform::simulated
