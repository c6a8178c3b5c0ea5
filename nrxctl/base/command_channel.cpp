#include "nrxctl/base/command_channel.h"

#include <array>

#include "nrxctl/base/channel.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "platform/connection.h"

namespace nrx {

namespace {

// Method selectors of an interface service.
constexpr std::uint32_t write_report_selector = 1;
constexpr std::uint32_t read_report_selector = 2;
constexpr std::uint32_t command_selector = 3;

// Calls a method whose one scalar says which report or command is meant. On success response is cut
// to what came back.
platform::return_code call_with_id(const channel& to, std::uint32_t selector, std::uint32_t id,
                                   platform::byte_view structure, platform::byte_span& response) {
    const std::array<std::uint64_t, 1> scalars{id};
    platform::call_outputs outputs{{}, response};
    const auto kr = platform::call(to.connect, selector, {scalars, structure}, outputs);
    if (kr == platform::success) response = outputs.structure;
    return kr;
}

platform::return_code read_report(const channel& from, std::uint32_t report_id,
                                  platform::byte_span& report) {
    return call_with_id(from, read_report_selector, report_id, {}, report);
}

void announce_unsupported(std::uint32_t command, platform::byte_view payload) {
    text_line line;
    line.text("command 0x").hex(command).text(" is not supported for device");
    print_line(line.view());
    hex_dump(payload, "payload");
}

}  // namespace

platform::return_code get_report(std::string_view service_name, std::uint32_t report_id,
                                 platform::byte_span& report) {
    channel from;
    const auto opened = open_channel(service_name, from);
    if (opened != platform::success) return opened;
    const auto kr = read_report(from, report_id, report);
    check_success(kr, "kr == 0 ");
    return kr;
}

platform::return_code get_report_quiet(std::string_view service_name, std::uint32_t report_id,
                                       platform::byte_span& report) {
    channel from;
    const auto opened = open_channel(service_name, from, expected_failure::is_silent);
    return opened == platform::success ? read_report(from, report_id, report) : opened;
}

platform::return_code set_report(std::string_view service_name, std::uint32_t report_id,
                                 platform::byte_view report) {
    channel to;
    const auto opened = open_channel(service_name, to);
    if (opened != platform::success) return opened;
    platform::byte_span no_response;
    const auto kr = call_with_id(to, write_report_selector, report_id, report, no_response);
    check_success(kr, "kr == 0 ");
    return kr;
}

platform::return_code send_command(std::string_view service_name, std::uint32_t command,
                                   platform::byte_view payload, platform::byte_span& response,
                                   expected_failure failure) {
    channel to;
    const auto opened = open_channel(service_name, to);
    if (opened != platform::success) return opened;
    const auto kr = call_with_id(to, command_selector, command, payload, response);
    if (failure == expected_failure::is_silent) return kr;
    if (kr == platform::unsupported) announce_unsupported(command, payload);
    check_success(kr, "kr == 0 ");
    return kr;
}

}  // namespace nrx
