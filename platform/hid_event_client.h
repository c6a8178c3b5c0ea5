// The tool as a client of the host's HID event system.
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

// A client of the event system; released by whoever holds it, which takes it off the event loop.
using hid_event_client = handle<hid_event_client_kind>;

struct hid_service_list_kind {
    static void release(handle_id id);
};

// A list of the HID services that a client sees; released by whoever holds it.
using hid_service_list = handle<hid_service_list_kind>;

// A client of the event system; none if the host has no such system. The caller owns it.
hid_event_client create_hid_event_client();

// Each installs what is called, in place of an earlier callback: with an event; after the event
// system was reset; with the records of a statistics update of the firmware, back to back, which
// are kept until the end of the callback. Fails with not_found if there is no such client, and with
// the host's code.
return_code set_event_callback(const hid_event_client& client,
                               std::function<void(const hid_event& event)> callback);
return_code set_reset_callback(const hid_event_client& client, std::function<void()> callback);
return_code set_statistics_callback(const hid_event_client& client,
                                    std::function<void(byte_view records)> callback);

// Lets the client call back from the event loop of this thread. Fails as the above.
return_code schedule_on_loop(const hid_event_client& client);

// The list of the HID services that are there now; none if there is no such client or the host has
// none to give. The caller owns it.
hid_service_list services_of(const hid_event_client& client);

}  // namespace platform
