// When the host was started.
#pragma once

#include <cstdint>
#include <optional>

namespace nrx {

// The host's boot time in microseconds since 1970, UTC; none, and nothing is reported, if the host
// does not tell.
std::optional<std::int64_t> boot_time_usec();

}  // namespace nrx
