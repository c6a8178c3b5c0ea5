#include "nrxctl/options/watch_options.h"

#include <chrono>
#include <limits>

#include "nrxctl/nrxtoollib.h"
#include "platform/clock.h"
#include "platform/interrupt.h"
#include "platform/run_loop.h"

namespace nrx::nrxctl {

namespace {

// As long as it lives, an interrupt stops the event loop; then the default action, which ends the
// process, is back. An interrupt that comes when the loop of an option has ended already, but
// before that, is a stop for later: a stop is never lost, so the next option that runs the loop
// ends at once.
class interrupt_stops_loop {
public:
    interrupt_stops_loop() { platform::handle_interrupt(platform::stop_loop); }
    ~interrupt_stops_loop() { platform::restore_default_interrupt(); }
    interrupt_stops_loop(const interrupt_stops_loop&) = delete;
    interrupt_stops_loop& operator=(const interrupt_stops_loop&) = delete;
};

// The clocks as HID events are measured by.
void set_clock_references() {
    constexpr double microseconds = 1e6;
    const platform::clock_reading now = platform::read_clocks();
    monotonic_reference = tick_period * static_cast<double>(now.ticks);
    wall_reference = static_cast<double>(now.wall.seconds) +
                     static_cast<double>(now.wall.microseconds) / microseconds;
}

}  // namespace

outcome watch_events(const option_words& words) {
    std::optional<std::chrono::seconds> duration;
    if (const auto word = words.take()) {
        constexpr auto longest = std::numeric_limits<std::int32_t>::max();
        duration = std::chrono::seconds(parse_number_up_to(longest, *word, "seconds are invalid"));
    }
    set_clock_references();
    const interrupt_stops_loop stopping;
    return outcome_of(watch_hid_events(duration));
}

// The mode is switched off whatever became of the watch, and whoever interrupts that.
outcome watch_spi(const option_words& words) {
    const auto mode_word = words.take();
    if (!mode_word) return outcome::misused;
    constexpr auto largest_mode = std::numeric_limits<std::uint32_t>::max();
    const std::uint32_t mode = parse_number_up_to(largest_mode, *mode_word, "mode is invalid");
    std::int32_t service_id = 0;
    if (!resolve_service_id(words.argument, service_id)) {
        print_line(text_line().text("service is invalid (").text(words.argument).text(")").view());
        return outcome::failed;
    }
    const interrupt_stops_loop stopping;
    const platform::return_code result = watch_spi_status(service_id, mode);
    if (mode != 0) watch_spi_status(service_id, 0);
    return outcome_of(result);
}

}  // namespace nrx::nrxctl
