// The driver that serves all HID devices of the coprocessor.
#pragma once

#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Calls the driver's structure method with input. Its reply goes into the room that output gives;
// on success output is cut to what came back, on failure it is as it was. Fails, with a failure
// report, with not_found if there is no such driver, the platform's code for an open or a call that
// failed, and no_memory if opening hands back no connection.
platform::return_code call_hid_driver(platform::byte_view input, platform::byte_span& output);

}  // namespace nrx
