// Clients of the host's HID event system.
#pragma once

#include <functional>

#include "platform/bytes.h"
#include "platform/handle.h"
#include "platform/hid_event.h"
#include "platform/return_code.h"

namespace platform {

struct hid_event_client_kind {
    static void release(handle_id id);
};

// A client of the event system. Releasing it removes it from the event loop.
using hid_event_client = handle<hid_event_client_kind>;

struct hid_service_list_kind {
    static void release(handle_id id);
};

// A list of the HID services that a client sees.
using hid_service_list = handle<hid_service_list_kind>;

// Creates a client. Returns an empty handle if the host has no HID event system.
hid_event_client create_hid_event_client();

// Callbacks of a client: for each event, after a reset of the event system, and for each statistics
// update of the firmware. An update is passed as its records back to back, which stay valid until
// the callback returns. Each function replaces the previous callback. They fail with not_found if
// the client handle is empty, and with the host's code.
return_code set_event_callback(const hid_event_client& client,
                               std::function<void(const hid_event& event)> callback);
return_code set_reset_callback(const hid_event_client& client, std::function<void()> callback);
return_code set_statistics_callback(const hid_event_client& client,
                                    std::function<void(byte_view records)> callback);

// Schedules the callbacks of the client on the event loop of this thread. Fails like the functions
// above.
return_code schedule_on_loop(const hid_event_client& client);

// Lists the HID services that are present. Returns an empty handle if the client handle is empty or
// the host cannot provide a list.
hid_service_list list_hid_services(const hid_event_client& client);

}  // namespace platform
