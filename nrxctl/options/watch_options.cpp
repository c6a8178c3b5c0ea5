#include <chrono>
#include <cstdint>
#include <limits>
#include <optional>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/option_functions.h"
#include "platform/clock.h"
#include "platform/interrupt.h"
#include "platform/run_loop.h"

namespace nrx::nrxctl {

namespace {

// While it exists, an interrupt stops the event loop. Its destructor restores the default action,
// which ends the process. An interrupt between the end of the loop and the destructor is kept: it
// ends the next option that runs the loop at once, as the user asked for the end.
class loop_interrupt_handler {
public:
    loop_interrupt_handler() { platform::set_interrupt_handler(platform::stop_loop); }
    ~loop_interrupt_handler() { platform::restore_default_interrupt(); }
    loop_interrupt_handler(const loop_interrupt_handler&) = delete;
    loop_interrupt_handler& operator=(const loop_interrupt_handler&) = delete;
};

// Sets the references with which the times of HID events are computed.
void set_clock_references() {
    constexpr double microseconds = 1e6;
    const platform::clock_reading now = platform::read_clocks();
    monotonic_reference = tick_period * static_cast<double>(now.ticks);
    wall_reference = static_cast<double>(now.wall.seconds) +
                     static_cast<double>(now.wall.microseconds) / microseconds;
}

}  // namespace

option_action watch_events(option_arguments& arguments) {
    std::optional<std::chrono::seconds> duration;
    if (!arguments.at_end()) {
        constexpr auto max_seconds = std::numeric_limits<std::int32_t>::max();
        duration =
            std::chrono::seconds(arguments.next_number({0, max_seconds}, "a number of seconds"));
    }
    return [duration, count = arguments.settings().use_count()] {
        set_print_limit(count);
        set_clock_references();
        const loop_interrupt_handler handler;
        watch_hid_events(duration);
    };
}

// Switches the mode off after the watch even if the watch failed or was interrupted.
option_action watch_spi(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    constexpr auto max_mode = std::numeric_limits<std::uint32_t>::max();
    const std::uint32_t mode = arguments.next_number({0, max_mode}, "a mode");
    return [service, mode, count = arguments.settings().use_count()] {
        service_id id{};
        if (!resolve_service_id(service, id)) return count_failure();
        const explanation_scope scope([&](explanation& given) {
            given = {quoted(service) + " has no HID device", "--list shows all services"};
        });
        set_print_limit(count);
        const loop_interrupt_handler handler;
        watch_spi_status(id, mode);
        if (mode != 0) watch_spi_status(id, 0);
    };
}

}  // namespace nrx::nrxctl
