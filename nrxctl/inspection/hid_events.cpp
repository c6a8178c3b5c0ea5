#include "nrxctl/inspection/hid_events.h"

#include <bit>
#include <cstdint>
#include <iomanip>
#include <ios>

#include "nrxctl/base/field_text.h"
#include "nrxctl/base/tick_period.h"
#include "nrxctl/inspection/clock_references.h"
#include "nrxctl/inspection/event_stream.h"
#include "nrxctl/inspection/hid_event_times.h"
#include "platform/clock.h"

namespace nrx {

double first_event_time = 0;
double last_event_time = 0;
double last_wall_time = 0;

namespace {

// When an event happened, in seconds of the monotonic clock, and how long it took to come.
struct event_time {
    double happened;
    double latency;
};

event_time time_of(const platform::hid_event& event) {
    constexpr std::int64_t latency_scale = 1'000;
    constexpr double latencies_per_second = 1'000'000;
    return {tick_period * static_cast<double>(event.ticks),
            static_cast<double>(event.latency(latency_scale)) / latencies_per_second};
}

void switch_to_fixed_notation(std::ostream& out) {
    constexpr int digits = 6;
    out << std::fixed << std::setprecision(digits) << std::left;
}

void print_times(std::ostream& out, const event_time& time) {
    out << time.happened - first_event_time << " ∂=" << time.happened - last_event_time
        << " latency: " << time.latency;
}

void print_null(std::ostream& out, const event_time& time) {
    out << "[null] ";
    print_times(out, time);
}

void print_accelerometer(std::ostream& out, const event_time& time,
                         const platform::hid_event& event) {
    switch_to_fixed_notation(out);
    out << "[accelerometer] ";
    print_times(out, time);
    out << " " << event.fraction(platform::accelerometer_x) << ", "
        << event.fraction(platform::accelerometer_y) << ", "
        << event.fraction(platform::accelerometer_z);
    out << " [" << event.integer(platform::accelerometer_type) << "/"
        << event.integer(platform::accelerometer_subtype) << "] "
        << event.integer(platform::accelerometer_sequence);
}

void print_vendor_defined(std::ostream& out, const event_time& time,
                          const platform::hid_event& event, std::string_view label) {
    constexpr int width = 11;
    constexpr double shortest_beat = 0.4;
    constexpr double longest_beat = 0.6;
    const double now = tick_period * static_cast<double>(platform::ticks());
    const double wall = (time.happened - monotonic_reference) + wall_reference;
    const double since_last = wall - last_wall_time;
    switch_to_fixed_notation(out);
    out << "now: " << std::setw(width) << now << " ts: " << std::setw(width) << time.happened
        << " delta: " << std::setw(width) << now - time.happened << "\t '"
        << text_before_nul(event.vendor_data) << "' \t wall: " << std::setw(width) << wall
        << " delta: " << std::setw(width) << " " << since_last << label << " ";
    const bool is_on_beat = shortest_beat < since_last && since_last < longest_beat;
    if (!is_on_beat) out << "<-------------------------------";
    last_wall_time = wall;
}

void print_other(std::ostream& out, const event_time& time, std::uint32_t type) {
    out << "type: " << type << "latency: " << time.latency << " µs";
}

// What the host numbers, in the form of a pointer.
template <class Kind>
const void* as_pointer(const platform::handle<Kind>& object) {
    return std::bit_cast<const void*>(std::uintptr_t{object.id()});
}

}  // namespace

void print_hid_event(const platform::hid_event& event, std::string_view label) {
    const event_time time = time_of(event);
    if (first_event_time == 0) first_event_time = time.happened;
    std::ostream& out = event_stream();
    switch (event.type) {
        case platform::null_event:
            print_null(out, time);
            break;
        case platform::accelerometer_event:
            print_accelerometer(out, time, event);
            break;
        case platform::vendor_defined_event:
            print_vendor_defined(out, time, event, label);
            break;
        default:
            print_other(out, time, event.type);
    }
    end_event_line();
    last_event_time = time.happened;
}

void reset_callback(const platform::hid_event_client& client, const void* context) {
    const platform::hid_service_list services = platform::services_of(client);
    event_stream() << "ResetCallback " << as_pointer(client) << " " << context
                   << " services: " << as_pointer(services);
    end_event_line();
}

}  // namespace nrx
