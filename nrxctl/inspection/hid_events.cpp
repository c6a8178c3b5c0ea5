#include "nrxctl/inspection/hid_events.h"

#include <bit>
#include <cstdint>
#include <iomanip>
#include <ios>

#include "nrxctl/base/clock_references.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/inspection/hid_event_state.h"
#include "platform/clock.h"

namespace nrx {

namespace {

// When an event occurred, on the monotonic clock, and how long after that it arrived, in seconds.
struct event_time {
    double occurred;
    double latency;
};

event_time time_of(const platform::hid_event& event) {
    constexpr std::int64_t nanoseconds_per_microsecond = 1'000;
    constexpr double microseconds_per_second = 1'000'000;
    const auto microseconds = static_cast<double>(event.latency(nanoseconds_per_microsecond));
    return {tick_period * static_cast<double>(event.ticks), microseconds / microseconds_per_second};
}

void set_fixed_notation(std::ostream& out) {
    constexpr int digits = 6;
    out << std::fixed << std::setprecision(digits) << std::left;
}

void print_times(std::ostream& out, const event_time& time) {
    out << time.occurred - first_event_time << " ∂=" << time.occurred - last_event_time
        << " latency: " << time.latency;
}

void print_null(std::ostream& out, const event_time& time) {
    out << "[null] ";
    print_times(out, time);
}

void print_accelerometer(std::ostream& out, const event_time& time,
                         const platform::hid_event& event) {
    set_fixed_notation(out);
    out << "[accelerometer] ";
    print_times(out, time);
    out << " " << event.real(platform::accelerometer_x) << ", "
        << event.real(platform::accelerometer_y) << ", " << event.real(platform::accelerometer_z);
    out << " [" << event.integer(platform::accelerometer_type) << "/"
        << event.integer(platform::accelerometer_subtype) << "] "
        << event.integer(platform::accelerometer_sequence);
}

void print_vendor_defined(std::ostream& out, const event_time& time,
                          const platform::hid_event& event, std::string_view label) {
    constexpr int width = 11;
    constexpr double min_interval = 0.4;
    constexpr double max_interval = 0.6;
    const double now = tick_period * static_cast<double>(platform::ticks());
    const double wall = (time.occurred - monotonic_reference) + wall_reference;
    const double interval = wall - last_wall_time;
    set_fixed_notation(out);
    out << "now: " << std::setw(width) << now << " ts: " << std::setw(width) << time.occurred
        << " delta: " << std::setw(width) << now - time.occurred << "\t '"
        << text_before_nul(event.vendor_data) << "' \t wall: " << std::setw(width) << wall
        << " delta: " << std::setw(width) << " " << interval << label << " ";
    const bool is_regular = min_interval < interval && interval < max_interval;
    if (!is_regular) out << "<-------------------------------";
    last_wall_time = wall;
}

void print_other(std::ostream& out, const event_time& time, std::uint32_t type) {
    out << "type: " << type << "latency: " << time.latency << " µs";
}

// The platform's number of an object, in the form of a pointer.
template <class Kind>
const void* as_pointer(const platform::handle<Kind>& object) {
    return std::bit_cast<const void*>(std::uintptr_t{object.id()});
}

}  // namespace

void print_hid_event(const platform::hid_event& event, std::string_view label) {
    const event_time time = time_of(event);
    if (first_event_time == 0) first_event_time = time.occurred;
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
    last_event_time = time.occurred;
}

void reset_callback(const platform::hid_event_client& client, const void* context) {
    const platform::hid_service_list services = platform::list_hid_services(client);
    event_stream() << "ResetCallback " << as_pointer(client) << " " << context
                   << " services: " << as_pointer(services);
    end_event_line();
}

}  // namespace nrx
