// The times of a record: local calendar time, and the host's boot time.
#pragma once

#include <cstdint>
#include <optional>

#include "nrxctl/decoders/short_text.h"

namespace nrx {

// Returns the local calendar time, "Nov 16 17:22:28.123456", of a timestamp in microseconds of the
// coprocessor's time. Months are named as in the C locale. Returns nullopt silently if there is no
// time-sync service or its sync point lacks a number.
//
// The sync point is read from the registry at every call. The text of the last second is cached. It
// is formatted again if tzset has changed the zone's standard offset or whether it has daylight
// saving time; any other change of the zone takes effect from the next second on.
std::optional<short_text> calendar_time(std::uint64_t timestamp);

// Returns the host's boot time in microseconds since 1970, UTC. Returns nullopt silently if the
// host does not provide it.
std::optional<std::int64_t> boot_time_usec();

}  // namespace nrx
