// HID device objects. They give access to a HID device without calling methods of its driver.
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

// A HID device object. Releasing it does not close the device.
using hid_device = handle<hid_device_kind>;

// Creates a device object for a registry service. Returns an empty handle if the service is gone or
// is not a HID device.
hid_device create_hid_device(const service& provider);

// Opens the device without options. Fails with the device's code, and with not_found if it is gone.
return_code open(const hid_device& device);

// Reads a feature report into the buffer and shrinks the span to the bytes that the device
// returned. Fails with bad_argument if the device is not open or the buffer is too small, with
// unsupported if it has no such report, and with not_found if it is gone. A failure leaves the span
// as it was.
return_code read_feature_report(const hid_device& device, std::uint8_t report_id,
                                byte_span& report);

// Closes the device without options. Fails with bad_argument if it was not open, and with the
// device's code; the device is closed even then.
return_code close(const hid_device& device);

}  // namespace platform
