// SPI status records, as the HID device of a sensor delivers them.
#pragma once

#include "platform/bytes.h"

namespace nrx {

// Prints one record: captured MOSI, MISO or accelerometer variance data as a dump under a heading,
// or an error status as a line. An unknown record type prints nothing. A record too short for its
// type (9 bytes, 17 for a status) is dumped, with a failure report; an empty one prints nothing.
void print_spi_status(platform::byte_view record);

}  // namespace nrx
