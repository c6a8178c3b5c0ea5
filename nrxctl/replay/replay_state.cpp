#include "nrxctl/replay/replay_state.h"

#include <array>
#include <optional>
#include <string>

#include "nrxctl/base/check.h"
#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/name_table.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/services.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

// The report with the state of every service, read and written.
constexpr report_id state_report = 0x47;

constexpr std::size_t max_entries = 32;

}  // namespace

std::vector<replay_state_entry> replay_status() {
    std::array<std::uint8_t, max_entries * replay_state_entry::wire_size> buffer{};
    platform::byte_span report = buffer;
    const auto kr = get_report(replay_app_name, state_report, report);
    if (kr != platform::success) return {};
    std::vector<replay_state_entry> entries;
    for_each_record(report, replay_state_entry::wire_size, [&](platform::byte_view entry) {
        const reply_fields fields(entry);
        entries.push_back({fields.s32(0), fields.u32(4), fields.u32(8)});
    });
    return entries;
}

void set_replay_state(std::span<const std::string_view> services, std::uint32_t delay,
                      std::uint32_t state) {
    std::vector<std::uint8_t> report;
    for (const std::string_view service : services) {
        service_id id = 0;
        const bool success = resolve_service_id(service, id);
        if (!check(success, condition::success)) return;
        append_words(report, {wire_word(id), delay, state});
    }
    const auto kr = set_report(replay_app_name, state_report, report);
    check_success(kr, condition::kr_is_zero);
}

namespace replay {

namespace {

constexpr std::array state_rows{
    name_row{replay_state::inactive, "inactive"},
    name_row{replay_state::loaded, "loaded"},
    name_row{replay_state::enabled, "enabled"},
};
constexpr name_table state_names(state_rows);

// Returns the services that the remaining arguments name; none, with a failure report, if there are
// no arguments.
std::vector<std::string_view> read_services(argument_cursor& arguments) {
    std::vector<std::string_view> services;
    while (const auto service = arguments.next())
        services.push_back(*service);
    check_explained(!services.empty(), condition::arguments_remain, [] {
        return explanation{"enable, disable and schedule-enable need SERVICE..."};
    });
    return services;
}

void set_state(std::span<const std::string_view> services, std::uint32_t delay,
               std::uint32_t state) {
    if (!services.empty()) set_replay_state(services, delay, state);
}

struct schedule_args {
    std::string_view delay_argument;
    std::uint32_t delay;  // seconds
    std::vector<std::string_view> services;
};

// Returns nullopt with a failure report if an argument is missing.
std::optional<schedule_args> read_schedule_args(argument_cursor& arguments) {
    const auto argument = arguments.next();
    if (!check_explained(argument, condition::arguments_remain,
                         [] { return explanation{"schedule-enable needs SECONDS SERVICE..."}; })) {
        return std::nullopt;
    }
    const std::uint32_t delay = parse_low_32_bits(*argument, "invalid delay");
    const auto services = read_services(arguments);
    if (services.empty()) return std::nullopt;
    return schedule_args{*argument, delay, services};
}

void print_entry(const replay_state_entry& entry) {
    constexpr std::size_t name_width = 10;
    std::string name;
    if (!service_name_for_id(entry.service_id, name))
        name = std::to_string(wire_word(entry.service_id));
    text_line line;
    line.text("Service ").pad_right(name, name_width).text(" is ");
    if (const std::string_view* state_name = state_names.find(entry.state)) {
        line.text(*state_name);
    } else {
        line.number(entry.state);
    }
    print_line(line.view());
}

}  // namespace

bool is_enabled() {
    if (!replay_status().empty()) return true;
    print_failure("Replay is not enabled");
    return false;
}

void enable(argument_cursor& arguments) {
    if (is_enabled()) set_state(read_services(arguments), 0, replay_state::enabled);
}

void disable(argument_cursor& arguments) {
    if (is_enabled()) set_state(read_services(arguments), 0, replay_state::loaded);
}

void schedule_enable(argument_cursor& arguments) {
    if (!is_enabled()) return;
    if (const auto args = read_schedule_args(arguments))
        set_replay_state(args->services, args->delay, replay_state::enabled);
}

arguments_check check_services(argument_cursor& arguments) {
    return accepted_if(!read_services(arguments).empty());
}

arguments_check check_schedule(argument_cursor& arguments) {
    const auto args = read_schedule_args(arguments);
    if (!args) return arguments_check::refused;
    return check_32_bit_number(args->delay_argument) ? arguments_check::accepted
                                                     : arguments_check::usage_error;
}

void show_status(argument_cursor& /*arguments*/) {
    if (!is_enabled()) return;
    print_line("Replay status:");
    for (const replay_state_entry& entry : replay_status())
        print_entry(entry);
}

}  // namespace replay

}  // namespace nrx
