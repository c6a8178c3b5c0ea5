// HID device objects: a HID device of the registry, reached without its driver's method calls.
#pragma once

#include <cstdint>

#include "platform/bytes.h"
#include "platform/handle.h"
#include "platform/registry.h"
#include "platform/return_code.h"

namespace platform {

struct hid_device_kind {
    static void release(handle_id id);
};

// A HID device object; released by whoever holds it. Releasing does not close.
using hid_device = handle<hid_device_kind>;

// A device object for a registry service; none if the service is gone or no HID device.
hid_device create_hid_device(const service& provider);

// Opens the device without options. Fails with the device's code, and with not_found if it is gone.
return_code open(const hid_device& device);

// Reads a feature report into report, which is cut to the bytes that the device returned. Fails
// with bad_argument if the device is not open or the room is too small, with unsupported for a
// report that it does not have, and with not_found if it is gone; report is then as it was.
return_code feature_report(const hid_device& device, std::uint8_t report_id, byte_span& report);

// Closes the device without options. Fails with bad_argument if it was not open, and with the
// device's code, when it is closed all the same.
return_code close(const hid_device& device);

}  // namespace platform
