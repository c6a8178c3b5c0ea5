// What a virtual host has lent out.
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

// What stands behind a handle, kind by kind.
struct lent_service {
    entry_ref provider;
};
struct lent_connection {
    entry_ref provider;
};
struct lent_mapping {
    entry_ref provider;
    std::shared_ptr<shared_queue> queue;
};
struct lent_port {
    std::shared_ptr<shared_queue> queue;  // that signals its data on the port; null if none does
};
struct lent_hid_device {
    entry_ref provider;
    bool is_open = false;
};
struct lent_hid_plugin {
    entry_ref provider;
};
struct lent_hid_interface {
    std::shared_ptr<record_listener> listener;
};
struct lent_hid_event_client {
    std::shared_ptr<event_listener> listener;
};
struct lent_hid_services {
    std::vector<entry_ref> services;
};

// A program holds few objects at once, and gives back first what it took last; so they stand in a
// row, looked for from the end. Lending and taking back in turn allocates nothing.
class handle_table {
public:
    using object =
        std::variant<lent_service, lent_connection, lent_mapping, lent_port, lent_hid_device,
                     lent_hid_plugin, lent_hid_interface, lent_hid_event_client, lent_hid_services>;

    // Lends an object out under a number of its own.
    handle_id lend(object lent);

    // The object of a kind with that number, until the next change of the table; null if there is
    // none.
    template <class Kind>
    [[nodiscard]] Kind* find(handle_id id) {
        object* found = find_any(id);
        return found == nullptr ? nullptr : std::get_if<Kind>(found);
    }

    // Takes the object with that number back, of whichever kind, if there is one.
    void take_back(handle_id id);

    // How many objects are out, and HID devices still open, those included whose object was taken
    // back before they were closed.
    [[nodiscard]] std::size_t still_open() const;

private:
    struct numbered_object {
        handle_id id;
        object lent;
    };

    object* find_any(handle_id id);

    std::vector<numbered_object> objects_;
    handle_id last_id_ = 0;
    std::size_t hid_devices_left_open_ = 0;
};

}  // namespace platform::simulated
