// The clocks of the virtual host.

#include <ratio>
#include <string>

#include "platform/clock.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interrupts.h"

namespace platform {

namespace {

// 24 ticks in a microsecond: a reader that takes ticks for another unit is found out.
using tick = std::chrono::duration<std::uint64_t, std::ratio<1, 24'000'000>>;

std::uint64_t ticks_at(simulated::machine_clock::time instant) {
    return std::chrono::duration_cast<tick>(instant).count();
}

}  // namespace

std::uint64_t ticks() {
    return ticks_at(simulated::current_machine().clock().now());
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

clock_reading read_clocks() {
    const simulated::machine_clock& clock = simulated::current_machine().clock();
    const auto now = clock.now();
    const auto wall = std::chrono::duration_cast<std::chrono::microseconds>(clock.wall_at(now));
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(wall);
    return {ticks_at(now), {seconds.count(), (wall - seconds).count()}};
}

std::optional<calendar_instant> boot_time() {
    simulated::machine& host = simulated::current_machine();
    const auto how = host.begin_call([] { return std::string("boot time"); });
    if (how) return std::nullopt;
    return host.boot_time();
}

}  // namespace platform
