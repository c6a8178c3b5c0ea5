// The objects that are open on a virtual host.
#pragma once

#include <cstddef>
#include <memory>
#include <variant>
#include <vector>

#include "platform/handle.h"
#include "platform/virtual/entry.h"
#include "platform/virtual/listeners.h"
#include "platform/virtual/shared_queue.h"

namespace platform::simulated {

// One type for each kind of handle.
struct service_object {
    entry_ref provider;
};
struct connection_object {
    entry_ref provider;
};
struct mapping_object {
    entry_ref provider;
    std::shared_ptr<shared_queue> queue;
};
struct port_object {
    std::shared_ptr<shared_queue> queue;  // the queue signalled on the port; null if not attached
};
struct hid_device_object {
    entry_ref provider;
    bool is_open = false;
};
struct hid_plugin_object {
    entry_ref provider;
};
struct hid_interface_object {
    std::shared_ptr<record_listener> listener;
};
struct hid_event_client_object {
    std::shared_ptr<event_listener> listener;
};
struct hid_service_list_object {
    std::vector<entry_ref> services;
};

// A program holds few objects at a time and releases the newest first, so the objects are kept in a
// vector that is searched from its end. Alternating insert and erase allocates nothing.
class handle_table {
public:
    using object = std::variant<service_object, connection_object, mapping_object, port_object,
                                hid_device_object, hid_plugin_object, hid_interface_object,
                                hid_event_client_object, hid_service_list_object>;

    // Adds an object and returns its new handle.
    handle_id insert(object added);

    // The object of the given type of a handle; null if there is none. The pointer is valid
    // until the table changes.
    template <class Object>
    [[nodiscard]] Object* find(handle_id id) {
        object* match = find_any(id);
        return match == nullptr ? nullptr : std::get_if<Object>(match);
    }

    // Removes the object of a handle, if there is one.
    void erase(handle_id id);

    // Number of objects, plus the number of HID devices that are open, including devices whose
    // object was erased before it was closed.
    [[nodiscard]] std::size_t open_count() const;

private:
    struct numbered_object {
        handle_id id;
        object value;
    };

    object* find_any(handle_id id);

    std::vector<numbered_object> objects_;
    handle_id last_id_ = 0;
    std::size_t hid_devices_left_open_ = 0;
};

}  // namespace platform::simulated
