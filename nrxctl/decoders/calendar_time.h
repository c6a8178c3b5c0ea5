// From the coprocessor's time to the local calendar.
#pragma once

#include <cstdint>
#include <optional>

#include "nrxctl/decoders/short_text.h"

namespace nrx {

// The local calendar time, "Nov 16 17:22:28.123456", of a time stamp in microseconds of the
// coprocessor's time, by the sync point that the driver's time-sync service has published last. The
// registry is asked anew at every call. None, and nothing is reported, if there is no such service
// or it publishes no sync point; one without both numbers is none.
std::optional<short_text> calendar_time(std::uint64_t timestamp);

}  // namespace nrx
