// Plug-ins of HID device drivers, and the device interfaces that they provide. An interface
// delivers the records that a device sends while its mode is on.
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

// The plug-in of a HID device. Releasing it destroys the plug-in.
using hid_plugin = handle<hid_plugin_kind>;

struct hid_interface_kind {
    static void release(handle_id id);
};

// A driver's interface to a HID device. Releasing it removes it from the event loop and leaves the
// mode as it is.
using hid_interface = handle<hid_interface_kind>;

// Creates the plug-in of a HID device service. Returns an empty handle if the service is gone or
// its driver has no plug-in.
hid_plugin create_hid_plugin(const service& provider);

// Queries the plug-in for the HID device interface. Returns an empty handle if the device is gone
// or the plug-in has no such interface.
hid_interface query_hid_interface(const hid_plugin& plugin);

// Schedules the callback of the interface on the event loop of this thread. Fails with not_found if
// the handle is empty or the device is gone, and with the driver's code.
return_code schedule_on_loop(const hid_interface& device);

// Receives a record as the device sent it. The bytes stay valid until the callback returns.
using record_callback = std::function<void(byte_view record)>;

// Sets the callback for records, which are delivered in the order of their arrival. It replaces the
// previous callback. Fails like schedule_on_loop.
return_code set_record_callback(const hid_interface& device, record_callback callback);

// Sets the mode of the device for the service with the given id. In mode 0, off, the device sends
// no records. Fails with bad_argument if the device does not belong to that service, with not_found
// if the handle is empty or the device is gone, and with the driver's code.
return_code set_mode(const hid_interface& device, std::int32_t service_id, std::uint32_t mode);

}  // namespace platform
