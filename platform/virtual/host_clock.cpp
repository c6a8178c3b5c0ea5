// The clocks and the event loop of the virtual host.

#include <ratio>
#include <string>

#include "platform/clock.h"
#include "platform/run_loop.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interrupts.h"

namespace platform {

using simulated::current_machine;
using simulated::machine;
using simulated::machine_clock;

namespace {

// 24 ticks per microsecond, so that code that mistakes ticks for another unit is detected.
using tick = std::chrono::duration<std::uint64_t, std::ratio<1, 24'000'000>>;

std::uint64_t ticks_at(machine_clock::time instant) {
    return std::chrono::duration_cast<tick>(instant).count();
}

}  // namespace

std::uint64_t ticks() {
    return ticks_at(current_machine().clock().now());
}

double tick_period() {
    return static_cast<double>(tick::period::num) / static_cast<double>(tick::period::den);
}

void sleep(std::chrono::microseconds duration) {
    machine& host = current_machine();
    const auto scope =
        host.begin_call([&] { return "sleep " + std::to_string(duration.count()) + " us"; });
    if (scope.fails()) return;
    const auto end = host.clock().now() + duration;
    while (host.clock().now() < end) {
        host.clock().advance(end);
        simulated::serve_interrupt();
    }
}

clock_reading read_clocks() {
    const machine_clock& clock = current_machine().clock();
    const auto now = clock.now();
    const auto wall = std::chrono::duration_cast<std::chrono::microseconds>(clock.wall_at(now));
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(wall);
    return {ticks_at(now), {seconds.count(), (wall - seconds).count()}};
}

std::optional<calendar_instant> boot_time() {
    machine& host = current_machine();
    const auto scope = host.begin_call([] { return std::string("boot time"); });
    if (scope.fails()) return std::nullopt;
    return host.boot_time();
}

return_code run_loop() {
    machine& host = current_machine();
    const auto scope = host.begin_call([] { return std::string("run loop"); });
    if (scope.fails()) return scope.code();
    return host.loop().run(host.clock(), std::nullopt);
}

return_code run_loop_for(std::chrono::microseconds duration) {
    machine& host = current_machine();
    const auto scope =
        host.begin_call([&] { return "run loop for " + std::to_string(duration.count()) + " us"; });
    if (scope.fails()) return scope.code();
    return host.loop().run(host.clock(), host.clock().now() + duration);
}

void stop_loop() {
    current_machine().loop().stop();
}

}  // namespace platform
