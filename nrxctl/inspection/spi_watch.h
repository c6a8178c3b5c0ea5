// Watching the SPI status records of a HID device.
#pragma once

#include <cstdint>

#include "platform/return_code.h"

namespace nrx {

// With a mode other than 0: sets the mode of the HID device that belongs to the interface service
// with that id, and prints each SPI status record that it sends, from the event loop of this
// thread, until the loop is stopped. The mode stays set: it is switched off with a call with mode
// 0, which only sets it. A step that fails is reported and ends the watch; returns success always.
platform::return_code watch_spi_status(std::int32_t service_id, std::uint32_t mode);

}  // namespace nrx
