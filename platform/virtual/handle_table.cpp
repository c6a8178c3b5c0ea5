#include "platform/virtual/handle_table.h"

#include <algorithm>
#include <utility>

namespace platform::simulated {

namespace {

bool is_open_hid_device(const handle_table::object& candidate) {
    const auto* device = std::get_if<hid_device_object>(&candidate);
    return device != nullptr && device->is_open;
}

}  // namespace

// The numbers can wrap around; 0 stays reserved for "no object".
handle_id handle_table::insert(object added) {
    if (++last_id_ == 0) ++last_id_;
    objects_.push_back({last_id_, std::move(added)});
    return last_id_;
}

void handle_table::erase(handle_id id) {
    const object* erased = find_any(id);
    if (erased == nullptr) return;
    if (is_open_hid_device(*erased)) ++hid_devices_left_open_;
    std::erase_if(objects_, [&](const numbered_object& candidate) { return candidate.id == id; });
}

std::size_t handle_table::open_count() const {
    const auto open_devices = std::count_if(
        objects_.begin(), objects_.end(),
        [](const numbered_object& candidate) { return is_open_hid_device(candidate.value); });
    return objects_.size() + hid_devices_left_open_ + static_cast<std::size_t>(open_devices);
}

handle_table::object* handle_table::find_any(handle_id id) {
    const auto match =
        std::find_if(objects_.rbegin(), objects_.rend(),
                     [&](const numbered_object& candidate) { return candidate.id == id; });
    return match == objects_.rend() ? nullptr : &match->value;
}

}  // namespace platform::simulated
