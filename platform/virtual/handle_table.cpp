#include "platform/virtual/handle_table.h"

#include <algorithm>
#include <utility>

namespace platform::simulated {

namespace {

bool is_open_hid_device(const handle_table::object& lent) {
    const auto* device = std::get_if<lent_hid_device>(&lent);
    return device != nullptr && device->is_open;
}

}  // namespace

// A stream of look-ups can use up all numbers; 0 stays none.
handle_id handle_table::lend(object lent) {
    if (++last_id_ == 0) ++last_id_;
    objects_.push_back({last_id_, std::move(lent)});
    return last_id_;
}

void handle_table::take_back(handle_id id) {
    const object* taken = find_any(id);
    if (taken == nullptr) return;
    if (is_open_hid_device(*taken)) ++hid_devices_left_open_;
    std::erase_if(objects_, [&](const numbered_object& one) { return one.id == id; });
}

std::size_t handle_table::still_open() const {
    const auto open_devices =
        std::count_if(objects_.begin(), objects_.end(),
                      [](const numbered_object& one) { return is_open_hid_device(one.lent); });
    return objects_.size() + hid_devices_left_open_ + static_cast<std::size_t>(open_devices);
}

handle_table::object* handle_table::find_any(handle_id id) {
    const auto found = std::find_if(objects_.rbegin(), objects_.rend(),
                                    [&](const numbered_object& one) { return one.id == id; });
    return found == objects_.rend() ? nullptr : &found->lent;
}

}  // namespace platform::simulated
