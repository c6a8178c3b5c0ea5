#include "nrxctl/decoders/boot_time.h"

#include "platform/clock.h"

namespace nrx {

std::optional<std::int64_t> boot_time_usec() {
    constexpr std::int64_t microseconds_per_second = 1000000;
    const auto booted = platform::boot_time();
    if (!booted) return std::nullopt;
    return booted->seconds * microseconds_per_second + booted->microseconds;
}

}  // namespace nrx
