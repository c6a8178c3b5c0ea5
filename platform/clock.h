// The host's clocks.
#pragma once

#include <cstdint>
#include <optional>

namespace platform {

// An instant since 1970, UTC.
struct calendar_instant {
    std::int64_t seconds;
    std::int64_t microseconds;
};

// When the host was started: the same instant as long as the process lives. None if the host does
// not tell.
std::optional<calendar_instant> boot_time();

}  // namespace platform
