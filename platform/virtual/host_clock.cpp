// The clocks of the virtual host.

#include <ratio>
#include <string>

#include "platform/clock.h"
#include "platform/virtual/machine.h"

namespace platform {

namespace {

// 24 ticks in a microsecond: a reader that takes ticks for another unit is found out.
using tick = std::chrono::duration<std::uint64_t, std::ratio<1, 24'000'000>>;

}  // namespace

std::uint64_t ticks() {
    const auto now = simulated::current_machine().clock().now();
    return std::chrono::duration_cast<tick>(now).count();
}

double tick_period() {
    return static_cast<double>(tick::period::num) / static_cast<double>(tick::period::den);
}

void sleep(std::chrono::microseconds duration) {
    simulated::machine& host = simulated::current_machine();
    const auto how =
        host.begin_call([&] { return "sleep " + std::to_string(duration.count()) + " us"; });
    if (how) return;
    const auto end = host.clock().now() + duration;
    while (host.clock().now() < end) {
        host.clock().pass(end);
        simulated::serve_interrupt();
    }
}

std::optional<calendar_instant> boot_time() {
    simulated::machine& host = simulated::current_machine();
    const auto how = host.begin_call([] { return std::string("boot time"); });
    if (how) return std::nullopt;
    return host.boot_time();
}

}  // namespace platform
