// Prints any bytes as records of HID devices and of the HID event system. The first byte of the
// input selects what the rest is: statistics records, an SPI status record, or the data of a
// vendor-defined event.
#include <algorithm>
#include <cstdint>
#include <vector>

#include "fuzz/support/harness.h"
#include "nrxctl/inspection/hid_events.h"
#include "nrxctl/inspection/hid_statistics.h"
#include "nrxctl/printers/spi_status.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    // A copy in an allocation of its own size, so that a sanitizer finds a read beyond it.
    const std::vector<std::uint8_t> bytes(data + 1, data + size);
    switch (data[0] % 3) {
        case 0:
            nrx::stats_callback(bytes);
            break;
        case 1:
            nrx::print_spi_status(bytes);
            break;
        default:
            nrx::print_hid_event({.type = platform::vendor_defined_event, .vendor_data = bytes},
                                 fuzz::as_text(data, std::min<std::size_t>(size, 8)));
    }
    return 0;
}
