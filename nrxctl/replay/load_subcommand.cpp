#include <algorithm>
#include <array>
#include <optional>
#include <string>
#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/word_table.h"
#include "nrxctl/replay/replay_app.h"
#include "nrxctl/replay/replay_state.h"
#include "nrxctl/replay/sample_file.h"
#include "nrxctl/replay/subcommands.h"

namespace nrx::replay {

namespace {

// How the words want the samples to be played back, in the terms of the load request.
struct load_options {
    std::uint32_t completion = 1;
    std::uint32_t location = 1;
    std::uint32_t filter = 0;
};

struct option_word {
    std::string_view word;
    std::uint32_t value;
};

constexpr std::array completions{
    option_word{"default", 0},
    option_word{"periodic", 1},
    option_word{"stop", 2},
    option_word{"last", 3},
};
constexpr std::array locations{
    option_word{"dram", 1},
    option_word{"sram", 2},
    option_word{"local", 2},
};

// The value of a word, if there is one; value keeps its default if there is none. False, after a
// message, for a word that is not known.
bool read_option(std::optional<std::string_view> word, std::span<const option_word> known,
                 std::string_view refusal, std::uint32_t& value) {
    if (!word) return true;
    const option_word* row = find_word_row(known, *word);
    if (row == nullptr) {
        print_line(text_line().text(refusal).text(": ").text(*word).view());
        return false;
    }
    value = row->value;
    return true;
}

bool read_options(argument_words& words, load_options& options) {
    auto word = words.take();
    if (word == "filter") {
        options.filter = 1;
        word = words.take();
    }
    return read_option(word, completions, "Invalid completion", options.completion) &&
           read_option(words.take(), locations, "Invalid location", options.location);
}

// How far a load came. One that a message has stopped is not reported as a failure.
enum class progress { good, stopped, failed };

// Whether a service may take samples.
progress check_service(const std::string& name) {
    const auto entries = replay_status();
    std::int32_t id = 0;
    const bool resolved = resolve_service_id(name, id);
    const auto entry =
        std::find_if(entries.begin(), entries.end(), [&](const replay_state_entry& one) {
            return one.service_id == static_cast<std::uint32_t>(id);
        });
    const bool success = resolved && entry != entries.end();
    if (!check(success, "success")) return progress::failed;
    if (entry->state == replay_state::inactive) return progress::good;
    text_line line;
    line.text("Service ").text(name).text(" had already samples; you have to unload first");
    print_line(line.view());
    return progress::stopped;
}

std::vector<std::uint8_t> make_request(std::uint32_t service_id, const load_options& options,
                                       const event_list& events) {
    constexpr std::size_t header_size = 20;
    std::size_t byte_count = 0;
    for (const event_ptr& event : events)
        byte_count += event->size();
    std::vector<std::uint8_t> request;
    request.reserve(header_size + byte_count);
    append_words(request, {service_id, options.completion, options.location, options.filter,
                           static_cast<std::uint32_t>(byte_count)});
    for (const event_ptr& event : events)
        request.insert(request.end(), event->data(), event->data() + event->size());
    return request;
}

progress upload(const load_options& options, const event_list& events) {
    const std::string name = events.front()->name();
    std::int32_t id = 0;
    bool success = resolve_service_id(name, id);
    if (!check(success, "success")) return progress::failed;
    const auto request = make_request(static_cast<std::uint32_t>(id), options, events);
    service_conn conn(replay_app::service_name);
    success = conn.open();
    if (!check(success, "success")) return progress::failed;
    platform::call_outputs nothing;
    const platform::return_code kr =
        platform::call(conn.connection(), replay_app::load_method, {{}, request}, nothing);
    if (!check_success(kr, "kr == 0 ")) return progress::failed;
    text_line line;
    line.text(name).text(": loaded ").number(events.size()).text(" events");
    print_line(line.view());
    return progress::good;
}

// Uploads the samples of a file, those of all services or, if one of them cannot take any, of none.
progress load_file(const std::string& path, const load_options& options) {
    const auto groups = read_sample_file(path);
    const bool success = groups.has_value();
    if (!check(success, "success")) return progress::failed;
    progress reached = progress::good;
    for (auto group = groups->begin(); group != groups->end() && reached == progress::good; ++group)
        reached = check_service(group->first);
    for (auto group = groups->begin(); group != groups->end() && reached == progress::good; ++group)
        reached = upload(options, group->second);
    return reached;
}

}  // namespace

void load(argument_words& words) {
    if (!replay_is_enabled()) return;
    const auto path = words.take();
    if (!check(path, "argc > optind")) return;
    load_options options;
    if (!read_options(words, options)) return;
    const bool success = load_file(std::string(*path), options) != progress::failed;
    check(success, "success");
}

}  // namespace nrx::replay
