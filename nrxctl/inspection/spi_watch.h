// Watching the SPI status records of a HID device.
#pragma once

#include <cstdint>

#include "nrxctl/base/identifiers.h"
#include "platform/return_code.h"

namespace nrx {

// Sets the mode of the HID device that belongs to the interface service with that id. If the mode
// is not 0, prints each SPI status record that the device sends, from the event loop of this
// thread, until the loop is stopped; a watch of print_limit.h. The mode stays set after that; call
// again with mode 0 to switch it off. A step that fails is reported and ends the watch. Always
// returns success.
platform::return_code watch_spi_status(service_id id, std::uint32_t mode);

}  // namespace nrx
