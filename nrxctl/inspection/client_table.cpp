#include "nrxctl/inspection/client_table.h"

#include <array>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::uint32_t client_command = 0x39;
constexpr std::size_t entry_size = 31;
constexpr std::size_t max_entries = 16;

constexpr std::size_t name_size = 12;
constexpr std::size_t interval_offset = 12;
constexpr std::size_t batch_offset = 16;
constexpr std::size_t threshold_offset = 20;
constexpr std::size_t time_limit_offset = 24;
constexpr std::size_t in_use_offset = 28;
constexpr std::size_t option_offset = 29;
constexpr std::size_t power_offset = 30;

constexpr std::string_view heading =
    "name                                report    batch threshold timelimit options power";

void print_client(std::string_view label, platform::byte_view entry) {
    const reply_fields fields(entry);
    text_line line;
    line.text(label).pad_right(text_before_nul(entry.first(name_size)), 32).text(": ");
    line.number(fields.s32(interval_offset), 8).text(" ");
    line.number(fields.s32(batch_offset), 8).text(" ");
    line.number(fields.s32(threshold_offset), 9).text(" ");
    line.number(fields.s32(time_limit_offset), 9).text("       ");
    line.text(fields.u8(option_offset) != 0 ? "d" : " ").text(" ");
    print_line(line.number(fields.u8(power_offset), 5).view());
}

}  // namespace

void print_client_table(std::string_view label, std::string_view service_name) {
    std::array<std::uint8_t, max_entries * entry_size> buffer{};
    platform::byte_span entries = buffer;
    const auto kr = send_command(service_name, client_command, {}, entries, on_failure::ignore);
    if (kr == platform::success) print_clients(label, entries);
}

void print_clients(std::string_view label, platform::byte_view entries) {
    print_line(text_line().text(label).text(heading).view());
    for_each_record(entries, entry_size, [&](platform::byte_view entry) {
        if (entry[in_use_offset] != 0) print_client(label, entry);
    });
}

}  // namespace nrx
