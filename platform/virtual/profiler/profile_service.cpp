// The coprocessor's half of the virtual profiler behind the interface service "profile".

#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/profiler.h"

namespace platform::simulated {

namespace {

// Reports.
constexpr std::uint32_t configs_report = 0xd0;
constexpr std::uint32_t log_report = 0xd1;
constexpr std::uint32_t duration_report = 0xd2;
constexpr std::uint32_t error_action_report = 0xd5;

// Commands.
constexpr std::uint32_t statistics_command = 0x20;
constexpr std::uint32_t stop_command = 0x21;
constexpr std::uint32_t flush_command = 0x23;
constexpr std::uint32_t configure_command = 0x24;

// What the statistics command is about: a kind of statistics, and for event sources what to do.
constexpr std::uint32_t event_sources = 0;
constexpr std::uint32_t wake_requests = 10;
constexpr std::uint32_t clear = 0;
constexpr std::uint32_t read = 1;

return_code run_statistics(profiler_statistics& statistics, byte_view payload, byte_list& reply) {
    if (payload.size() != 8) return bad_argument;
    const std::uint32_t kind = get_u32(payload, 0);
    const std::uint32_t action = get_u32(payload, 4);
    if (kind == event_sources && action == clear) {
        statistics.clear_event_sources();
    } else if (kind == event_sources && action == read) {
        reply = statistics.event_sources();
    } else if (kind == wake_requests) {
        reply = statistics.wake_requests();
    } else {
        return unsupported;
    }
    return success;
}

return_code set_duration(profiler& of, byte_view report) {
    if (report.size() != 4) return bad_argument;
    of.set_duration(std::chrono::microseconds(get_u32(report, 0)));
    return success;
}

return_code check_error_action(byte_view report) {
    return report.size() == 4 && get_u32(report, 0) <= 1 ? success : bad_argument;
}

void add_reports(interface_driver& service, const std::shared_ptr<profiler>& shared) {
    service.set_report_source(configs_report, [shared](std::size_t room, byte_list& reply) {
        reply = shared->coprocessor_configs(room);
        return success;
    });
    service.set_report_source(log_report, [shared](std::size_t room, byte_list& reply) {
        reply = shared->take_coprocessor_log(room);
        return success;
    });
    service.set_report(duration_report, {0, 0, 0, 0});
    service.set_report_sink(duration_report,
                            [shared](byte_view report) { return set_duration(*shared, report); });
    service.set_report(error_action_report, {0, 0, 0, 0});
    service.set_report_sink(error_action_report, check_error_action);
}

void add_commands(interface_driver& service, const std::shared_ptr<profiler>& shared) {
    service.set_command(statistics_command, [shared](byte_view payload, byte_list& reply) {
        return run_statistics(shared->statistics(), payload, reply);
    });
    service.set_command(stop_command, [shared](byte_view /*payload*/, byte_list& /*reply*/) {
        shared->stop_coprocessor();
        return success;
    });
    service.set_command(flush_command, [shared](byte_view /*payload*/, byte_list& /*reply*/) {
        shared->flush();
        return success;
    });
    service.set_command(configure_command, [shared](byte_view payload, byte_list& /*reply*/) {
        return shared->configure_coprocessor(payload);
    });
}

}  // namespace

void serve_profile(interface_driver& service, const std::shared_ptr<profiler>& shared) {
    add_reports(service, shared);
    add_commands(service, shared);
}

}  // namespace platform::simulated
