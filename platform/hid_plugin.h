// The plug-in that the driver of a HID device brings along, and the device interface that it hands
// out: records that the device sends while a mode is on.
#pragma once

#include <cstdint>
#include <functional>

#include "platform/bytes.h"
#include "platform/handle.h"
#include "platform/registry.h"
#include "platform/return_code.h"

namespace platform {

struct hid_plugin_kind {
    static void release(handle_id id);
};

// The plug-in of a HID device; destroyed by whoever holds it.
using hid_plugin = handle<hid_plugin_kind>;

struct hid_interface_kind {
    static void release(handle_id id);
};

// A driver's interface to a HID device; released by whoever holds it, which takes it off the event
// loop, and leaves the mode as it is.
using hid_interface = handle<hid_interface_kind>;

// The plug-in for a HID device service; none if the service is gone or its driver brings none. The
// caller owns it.
hid_plugin create_hid_plugin(const service& provider);

// The driver's HID device interface; none if the device is gone or its plug-in has none. The caller
// owns it.
hid_interface query_hid_interface(const hid_plugin& plugin);

// Lets the interface call back from the event loop of this thread. Fails with not_found if there is
// no such interface or the device is gone, and with the driver's code.
return_code schedule_on_loop(const hid_interface& device);

// Takes a record as the device sent it; it is kept until the end of the callback.
using record_callback = std::function<void(byte_view record)>;

// Installs what is called with each record, in the order of their arrival, in place of an earlier
// callback. Fails as schedule_on_loop does.
return_code set_record_callback(const hid_interface& device, record_callback callback);

// Sets the device's mode for a service, by the service's id: 0 is off, and no record comes.
// Fails with bad_argument if the device is not that service's, with not_found if there is no such
// interface or the device is gone, and with the driver's code.
return_code set_mode(const hid_interface& device, std::int32_t service_id, std::uint32_t mode);

}  // namespace platform
