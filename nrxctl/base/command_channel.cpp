#include "nrxctl/base/command_channel.h"

#include <algorithm>
#include <array>
#include <memory>
#include <new>
#include <vector>

#include "nrxctl/base/channel.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/services.h"
#include "nrxctl/base/text_line.h"
#include "platform/connection.h"

namespace nrx {

namespace {

// Method selectors of an interface service.
constexpr std::uint32_t scalar_selector = 0;
constexpr std::uint32_t write_report_selector = 1;
constexpr std::uint32_t read_report_selector = 2;
constexpr std::uint32_t command_selector = 3;
constexpr std::uint32_t set_property_selector = 4;
constexpr std::uint32_t get_property_selector = 5;

// The HID driver.
constexpr std::uint32_t hid_client_type = 0x7a756d6f;  // "zumo"
constexpr std::uint32_t hid_structure_selector = 0;

// Calls a method. On success response is shrunk to the bytes returned.
platform::return_code call(const service_channel& channel, std::uint32_t selector,
                           const platform::call_inputs& inputs, platform::byte_span& response) {
    platform::call_outputs outputs{{}, response};
    const auto kr = platform::call(channel.connection, selector, inputs, outputs);
    if (kr == platform::success) response = outputs.structure;
    return kr;
}

// Calls a method whose one scalar is a report id or a command code.
platform::return_code call_with_id(const service_channel& channel, std::uint32_t selector,
                                   std::uint32_t id, platform::byte_view structure,
                                   platform::byte_span& response) {
    const std::array<std::uint64_t, 1> scalars{id};
    return call(channel, selector, {scalars, structure}, response);
}

void print_unsupported(std::uint32_t command, platform::byte_view payload) {
    text_line line;
    line.text("command 0x").hex(command).text(" is not supported for device");
    print_line(line.view());
    hex_dump(payload, "payload");
}

platform::dictionary match_hid_driver() {
    constexpr std::int32_t location = 1234;
    platform::dictionary matching = match_name("KeltoNRXHIDDriver");
    matching.set(platform::location_id_key, location);
    return matching;
}

}  // namespace

platform::return_code get_report(std::string_view service_name, report_id id,
                                 platform::byte_span& report) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel);
    if (open_result != platform::success) return open_result;
    const auto kr = call_with_id(channel, read_report_selector, id, {}, report);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code get_report_quiet(std::string_view service_name, report_id id,
                                       platform::byte_span& report) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel, on_failure::ignore);
    if (open_result != platform::success) return open_result;
    return call_with_id(channel, read_report_selector, id, {}, report);
}

platform::return_code set_report(std::string_view service_name, report_id id,
                                 platform::byte_view report) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel);
    if (open_result != platform::success) return open_result;
    platform::byte_span no_response;
    const auto kr = call_with_id(channel, write_report_selector, id, report, no_response);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code send_command(std::string_view service_name, std::uint32_t command,
                                   platform::byte_view payload, platform::byte_span& response,
                                   on_failure on_call_failure) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel);
    if (open_result != platform::success) return open_result;
    const auto kr = call_with_id(channel, command_selector, command, payload, response);
    if (on_call_failure == on_failure::ignore) return kr;
    if (kr == platform::unsupported) print_unsupported(command, payload);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code call_scalar_method(std::string_view service_name,
                                         std::span<const std::uint64_t> scalars) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel);
    if (open_result != platform::success) return open_result;
    platform::byte_span no_response;
    const auto kr = call(channel, scalar_selector, {scalars, {}}, no_response);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code set_named_property(std::string_view service_name,
                                         std::string_view property_name,
                                         platform::byte_view value) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel);
    if (open_result != platform::success) return open_result;
    // The message is the name with its NUL, then the value.
    const std::size_t name_size = property_name.size() + 1;
    const std::size_t size = name_size + value.size();
    const std::unique_ptr<std::uint8_t[]> buffer(new (std::nothrow) std::uint8_t[size]);
    if (!check(buffer, "buffer")) return platform::no_memory;
    auto* end = std::copy(property_name.begin(), property_name.end(), buffer.get());
    *end++ = 0;
    std::copy(value.begin(), value.end(), end);
    const std::array<std::uint64_t, 1> scalars{name_size};
    platform::byte_span no_response;
    const auto kr =
        call(channel, set_property_selector, {scalars, {buffer.get(), size}}, no_response);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code get_named_property(std::string_view service_name,
                                         std::string_view property_name,
                                         platform::byte_span& value) {
    service_channel channel;
    const auto open_result = open_channel(service_name, channel);
    if (open_result != platform::success) return open_result;
    std::vector<std::uint8_t> name(property_name.begin(), property_name.end());
    name.push_back(0);
    const auto kr = call(channel, get_property_selector, {{}, name}, value);
    if (kr == platform::unsupported) print_line("\nget named property not supported");
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code call_hid_driver(platform::byte_view input, platform::byte_span& output) {
    service_channel channel;
    const auto open_result =
        open_channel(platform::first_match(match_hid_driver()), hid_client_type, channel);
    if (open_result != platform::success) return open_result;
    const auto kr = call(channel, hid_structure_selector, {{}, input}, output);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

}  // namespace nrx
