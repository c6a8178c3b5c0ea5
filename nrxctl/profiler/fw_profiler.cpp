#include "nrxctl/profiler/fw_profiler.h"

#include <string_view>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/service_discovery.h"

namespace nrx {

namespace {

constexpr std::string_view profile_service = "profile";

// Reports.
constexpr std::uint32_t configs_report = 0xd0;
constexpr std::uint32_t duration_report = 0xd2;
constexpr std::uint32_t error_action_report = 0xd5;

// Commands.
constexpr std::uint32_t statistics_command = 0x20;
constexpr std::uint32_t stop_command = 0x21;
constexpr std::uint32_t flush_command = 0x23;
constexpr std::uint32_t configure_command = 0x24;

// What the statistics command is about, and what it does with it.
constexpr std::uint32_t event_sources = 0;
constexpr std::uint32_t wake_requests = 10;
constexpr std::uint32_t clear = 0;
constexpr std::uint32_t read = 1;

platform::return_code send(std::uint32_t command) {
    platform::byte_span no_reply;
    return send_command(profile_service, command, {}, no_reply);
}

platform::return_code send_statistics(std::uint32_t kind, std::uint32_t action,
                                      platform::byte_span& reply) {
    std::vector<std::uint8_t> payload;
    append_words(payload, {kind, action});
    return send_command(profile_service, statistics_command, payload, reply);
}

platform::return_code write_number(std::uint32_t report_id, std::uint32_t number) {
    std::vector<std::uint8_t> report;
    append_words(report, {number});
    return set_report(profile_service, report_id, report);
}

}  // namespace

bool fw_profiler_available() {
    return static_cast<bool>(find_service(profile_service));
}

platform::return_code send_fw_configs(std::span<const profiler_config> configs) {
    if (!fw_profiler_available()) return platform::success;
    platform::byte_span no_reply;
    return send_command(profile_service, configure_command, encode_configs(configs), no_reply,
                        expected_failure::is_silent);
}

std::vector<profiler_config> read_fw_configs() {
    std::vector<std::uint8_t> buffer(most_active_configs * profiler_config::wire_size);
    platform::byte_span reply = buffer;
    const auto kr = get_report_quiet(profile_service, configs_report, reply);
    return kr == platform::success ? decode_configs(reply) : std::vector<profiler_config>();
}

platform::return_code set_monitor_duration(std::uint32_t microseconds) {
    return write_number(duration_report, microseconds);
}

platform::return_code set_error_action(error_action action) {
    return write_number(error_action_report, static_cast<std::uint32_t>(action));
}

platform::return_code clear_event_sources() {
    platform::byte_span no_reply;
    return send_statistics(event_sources, clear, no_reply);
}

platform::return_code read_event_sources(platform::byte_span& rows) {
    return send_statistics(event_sources, read, rows);
}

platform::return_code read_wake_requests(platform::byte_span& counts) {
    return send_statistics(wake_requests, 0, counts);
}

platform::return_code stop_fw_profiler() {
    return send(stop_command);
}

platform::return_code flush_fw_profiler() {
    return send(flush_command);
}

}  // namespace nrx
