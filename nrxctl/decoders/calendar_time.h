// From the coprocessor's time to the local calendar.
#pragma once

#include <cstdint>
#include <optional>

#include "nrxctl/decoders/short_text.h"

namespace nrx {

// The local calendar time, "Nov 16 17:22:28.123456", of a time stamp in microseconds of the
// coprocessor's time, by the sync point that the driver's time-sync service has published last. The
// registry is asked anew at every call; only the local time of the last second is kept, for as long
// as the time zone stays the same. Months are named as in the C locale. None, and nothing is
// reported, if there is no such service or it publishes no sync point; a sync point that lacks a
// number counts as missing.
std::optional<short_text> calendar_time(std::uint64_t timestamp);

}  // namespace nrx
