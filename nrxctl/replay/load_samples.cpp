#include "nrxctl/replay/load_samples.h"

#include <algorithm>
#include <array>
#include <optional>
#include <string>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/services.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/replay_state.h"
#include "nrxctl/replay/sample_file.h"

namespace nrx::replay {

namespace {

// Methods of the replay application's driver. Loading takes a header and records, unloading a
// service id.
constexpr std::uint32_t load_method = 0;
constexpr std::uint32_t unload_method = 1;

platform::return_code call_app(const service_conn& conn, std::uint32_t method,
                               const std::vector<std::uint8_t>& request) {
    platform::call_outputs no_outputs;
    return platform::call(conn.connection(), method, {{}, request}, no_outputs);
}

// Prints "Service NAME" and then the message, which begins with a space and says what failed.
void print_service_message(std::string_view service, std::string_view message) {
    print_failure(text_line().text("Service ").text(service).text(message).view());
}

// Arguments of load, and what they mean in the header.

struct keyword_value {
    std::string_view keyword;
    std::uint32_t value;
};

constexpr std::array completions{
    keyword_value{"default", 0},
    keyword_value{"periodic", 1},
    keyword_value{"stop", 2},
    keyword_value{"last", 3},
};
constexpr std::array locations{
    keyword_value{"dram", 1},
    keyword_value{"sram", 2},
    keyword_value{"local", 2},
};

// Stores the value of an argument; leaves the default if there is no argument. Returns false after
// "Invalid <kind>: argument" as a line if the argument is unknown.
bool read_keyword(std::optional<std::string_view> argument, std::span<const keyword_value> table,
                  std::string_view kind, std::uint32_t& value) {
    if (!argument) return true;
    const keyword_value* row = find_keyword(table, *argument);
    if (row == nullptr) {
        print_failure(text_line().text("Invalid ").text(kind).text(": ").text(*argument).view());
        explain([&] { return unknown_keyword(kind, *argument, "expected", keywords_of(table)); });
        return false;
    }
    value = row->value;
    return true;
}

struct load_args {
    std::string path;
    replay_load_header header{};
};

// Returns nullopt after a message or a failure report if the file is missing or an argument is
// unknown.
std::optional<load_args> read_load_args(argument_cursor& arguments) {
    const auto path = arguments.next();
    if (!check_explained(path, condition::arguments_remain,
                         [] { return explanation{"load needs FILE"}; })) {
        return std::nullopt;
    }
    load_args args{std::string(*path)};
    auto argument = arguments.next();
    if (argument == "filter") {
        args.header.filter = 1;
        argument = arguments.next();
    }
    if (!read_keyword(argument, completions, "completion", args.header.completion) ||
        !read_keyword(arguments.next(), locations, "location", args.header.location)) {
        return std::nullopt;
    }
    return args;
}

// Returns the service that the next argument names, or nullopt with a failure report.
std::optional<std::string_view> read_first_service(argument_cursor& arguments) {
    const auto service = arguments.next();
    check_explained(service, condition::arguments_remain,
                    [] { return explanation{"unload needs SERVICE..."}; });
    return service;
}

// How a step of a load ended. A rejected step has printed a message; it is not a failed check.
enum class step_result { success, rejected, failed };

// Checks that a service accepts samples.
step_result check_service(const std::string& name) {
    const auto entries = replay_status();
    service_id id = 0;
    const bool resolved = resolve_service_id(name, id);
    const auto entry = std::find_if(entries.begin(), entries.end(),
                                    [&](const auto& row) { return row.service_id == id; });
    const bool success = resolved && entry != entries.end();
    if (!check(success, condition::success)) return step_result::failed;
    if (entry->state == replay_state::inactive) return step_result::success;
    print_service_message(name, " had already samples; you have to unload first");
    return step_result::rejected;
}

std::vector<std::uint8_t> make_request(replay_load_header header, const event_list& events) {
    std::size_t byte_count = 0;
    for (const event_ptr& event : events)
        byte_count += event->size();
    header.byte_count = static_cast<std::uint32_t>(byte_count);
    std::vector<std::uint8_t> request;
    append_words(request, {wire_word(header.service_id), header.completion, header.location,
                           header.filter, header.byte_count});
    request.reserve(request.size() + byte_count);
    for (const event_ptr& event : events)
        request.insert(request.end(), event->data(), event->data() + event->size());
    return request;
}

step_result upload(replay_load_header header, const event_list& events) {
    const std::string name = events.front()->name();
    bool success = resolve_service_id(name, header.service_id);
    if (!check(success, condition::success)) return step_result::failed;
    const auto request = make_request(header, events);
    service_conn conn(replay_app_name);
    success = conn.open();
    if (!check(success, condition::success)) return step_result::failed;
    const platform::return_code kr = call_app(conn, load_method, request);
    if (!check_success(kr, condition::kr_is_zero)) return step_result::failed;
    text_line line;
    line.text(name).text(": loaded ").number(events.size()).text(" events");
    print_line(line.view());
    return step_result::success;
}

// Checks every service of the file before it uploads the first, so that a file is rejected as a
// whole.
step_result load_file(const std::string& path, const replay_load_header& header) {
    const auto groups = read_sample_file(path);
    const bool success = groups.has_value();
    if (!check(success, condition::success)) return step_result::failed;
    if (groups->empty()) count_failure();
    for (const auto& [name, events] : *groups) {
        const step_result result = check_service(name);
        if (result != step_result::success) return result;
    }
    for (const auto& [name, events] : *groups) {
        const step_result result = upload(header, events);
        if (result != step_result::success) return result;
    }
    return step_result::success;
}

void unload_service(const service_conn& conn, std::string_view service) {
    service_id id = 0;
    if (!resolve_service_id(service, id)) {
        print_service_message(service, " not found");
        return;
    }
    std::vector<std::uint8_t> request;
    append_words(request, {wire_word(id)});
    if (call_app(conn, unload_method, request) != platform::success)
        print_service_message(service, " can't be unloaded");
}

}  // namespace

void load(argument_cursor& arguments) {
    if (!is_enabled()) return;
    const auto args = read_load_args(arguments);
    if (!args) return;
    const bool success = load_file(args->path, args->header) != step_result::failed;
    check(success, condition::success);
}

void unload(argument_cursor& arguments) {
    auto service = read_first_service(arguments);
    if (!service || !is_enabled()) return;
    service_conn conn(replay_app_name);
    const bool success = conn.open();
    if (!check(success, condition::success)) return;
    for (; service; service = arguments.next())
        unload_service(conn, *service);
}

arguments_check check_load(argument_cursor& arguments) {
    return accepted_if(read_load_args(arguments).has_value());
}

arguments_check check_unload(argument_cursor& arguments) {
    const bool has_service = read_first_service(arguments).has_value();
    while (arguments.next()) {
        // Whether the others exist is known only when they are unloaded.
    }
    return accepted_if(has_service);
}

}  // namespace nrx::replay
