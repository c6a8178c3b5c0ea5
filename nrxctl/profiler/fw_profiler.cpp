#include "nrxctl/profiler/fw_profiler.h"

#include <string_view>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/services.h"

namespace nrx {

namespace {

constexpr std::string_view profile_service = "profile";

constexpr report_id configs_report = 0xd0;
constexpr report_id duration_report = 0xd2;
constexpr report_id error_action_report = 0xd5;

constexpr std::uint32_t statistics_command = 0x20;
constexpr std::uint32_t stop_command = 0x21;
constexpr std::uint32_t flush_command = 0x23;
constexpr std::uint32_t configure_command = 0x24;

// The payload of the statistics command: a subject and an action.
constexpr std::uint32_t event_sources = 0;
constexpr std::uint32_t wake_requests = 10;
constexpr std::uint32_t clear_action = 0;
constexpr std::uint32_t read_action = 1;
constexpr std::uint32_t no_action = 0;  // wake requests can only be read

platform::return_code send(std::uint32_t command) {
    platform::byte_span no_response;
    return send_command(profile_service, command, {}, no_response);
}

platform::return_code send_statistics(std::uint32_t subject, std::uint32_t action,
                                      platform::byte_span& response) {
    std::vector<std::uint8_t> payload;
    append_words(payload, {subject, action});
    return send_command(profile_service, statistics_command, payload, response);
}

platform::return_code set_u32_report(report_id id, std::uint32_t value) {
    std::vector<std::uint8_t> report;
    append_words(report, {value});
    return set_report(profile_service, id, report);
}

}  // namespace

bool fw_profiler_available() {
    return static_cast<bool>(find_service(profile_service));
}

platform::return_code send_fw_configs(std::span<const profiler_config> configs) {
    if (!fw_profiler_available()) return platform::success;
    platform::byte_span no_response;
    return send_command(profile_service, configure_command, encode_configs(configs), no_response,
                        on_failure::ignore);
}

std::vector<profiler_config> read_fw_configs() {
    std::vector<std::uint8_t> buffer(max_active_configs * profiler_config::wire_size);
    platform::byte_span reply = buffer;
    const auto kr = get_report_quiet(profile_service, configs_report, reply);
    return kr == platform::success ? decode_configs(reply) : std::vector<profiler_config>();
}

platform::return_code set_monitor_duration(std::uint32_t microseconds) {
    return set_u32_report(duration_report, microseconds);
}

platform::return_code set_error_action(error_action action) {
    return set_u32_report(error_action_report, static_cast<std::uint32_t>(action));
}

platform::return_code clear_event_sources() {
    platform::byte_span no_response;
    return send_statistics(event_sources, clear_action, no_response);
}

platform::return_code read_event_sources(platform::byte_span& rows) {
    return send_statistics(event_sources, read_action, rows);
}

platform::return_code read_wake_requests(platform::byte_span& counts) {
    return send_statistics(wake_requests, no_action, counts);
}

platform::return_code stop_fw_profiler() {
    return send(stop_command);
}

platform::return_code flush_fw_profiler() {
    return send(flush_command);
}

}  // namespace nrx
