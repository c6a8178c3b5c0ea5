#include "platform/virtual/machine.h"

#include <algorithm>
#include <utility>

#include "platform/virtual/wrist_device.h"

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

// A stream of look-ups can use up all numbers; 0 stays none.
handle_id machine::next_handle() {
    if (++last_handle_ == 0) ++last_handle_;
    return last_handle_;
}

handle_id machine::lend_service(entry_ref provider) {
    return services_.lend(next_handle(), std::move(provider));
}

handle_id machine::lend_connection(entry_ref provider) {
    return connections_.lend(next_handle(), std::move(provider));
}

handle_id machine::lend_hid_device(entry_ref provider) {
    return hid_devices_.lend(next_handle(), hid_object{std::move(provider)});
}

handle_id machine::lend_mapping(queue_mapping mapping) {
    return mappings_.lend(next_handle(), std::move(mapping));
}

handle_id machine::lend_port() {
    return ports_.lend(next_handle(), nullptr);
}

handle_id machine::lend_hid_plugin(entry_ref provider) {
    return hid_plugins_.lend(next_handle(), std::move(provider));
}

handle_id machine::lend_hid_interface(std::shared_ptr<record_listener> listener) {
    return hid_interfaces_.lend(next_handle(), std::move(listener));
}

handle_id machine::lend_hid_event_client(std::shared_ptr<event_listener> listener) {
    return hid_event_clients_.lend(next_handle(), std::move(listener));
}

handle_id machine::lend_hid_service_list(std::vector<entry_ref> services) {
    return hid_service_lists_.lend(next_handle(), std::move(services));
}

namespace {

// What a table that lends out references holds under a number; null if it holds nothing.
template <class Reference>
Reference reference_in(const handle_table<Reference>& table, handle_id id) {
    const Reference* found = table.find(id);
    return found == nullptr ? nullptr : *found;
}

}  // namespace

entry_ref machine::service(handle_id id) const {
    return reference_in(services_, id);
}

entry_ref machine::connection(handle_id id) const {
    return reference_in(connections_, id);
}

entry_ref machine::hid_plugin(handle_id id) const {
    return reference_in(hid_plugins_, id);
}

std::shared_ptr<record_listener> machine::hid_interface(handle_id id) const {
    return reference_in(hid_interfaces_, id);
}

std::shared_ptr<event_listener> machine::hid_event_client(handle_id id) const {
    return reference_in(hid_event_clients_, id);
}

bool machine::attach(handle_id port, std::shared_ptr<shared_queue> queue) {
    auto* attached = ports_.find(port);
    if (attached != nullptr) *attached = std::move(queue);
    return attached != nullptr;
}

std::shared_ptr<shared_queue> machine::attached_queue(handle_id port) const {
    return reference_in(ports_, port);
}

void machine::take_back(handle_id id) {
    services_.take_back(id);
    connections_.take_back(id);
    if (const hid_object* released = hid_devices_.find(id)) {
        if (released->is_open) ++hid_devices_left_open_;
        hid_devices_.take_back(id);
    }
    mappings_.take_back(id);
    ports_.take_back(id);
    loop_.unschedule(id);
    hid_plugins_.take_back(id);
    hid_interfaces_.take_back(id);
    hid_event_clients_.take_back(id);
    hid_service_lists_.take_back(id);
}

std::size_t machine::open_handles() const {
    const auto opened = hid_devices_.count_if([](const hid_object& one) { return one.is_open; });
    return services_.size() + connections_.size() + hid_devices_.size() + hid_devices_left_open_ +
           opened + mappings_.size() + ports_.size() + hid_plugins_.size() +
           hid_interfaces_.size() + hid_event_clients_.size() + hid_service_lists_.size();
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
