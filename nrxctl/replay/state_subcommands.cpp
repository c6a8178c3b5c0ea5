#include <array>
#include <string>
#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/replay_state.h"
#include "nrxctl/replay/subcommands.h"

namespace nrx::replay {

namespace {

// In the order of the states.
constexpr std::array<std::string_view, 3> state_names{"inactive", "loaded", "enabled"};

// Puts the services that the remaining words name into a state.
void set_state(argument_words& words, std::uint32_t delay, std::uint32_t state) {
    std::vector<std::string_view> services;
    while (const auto word = words.take())
        services.push_back(*word);
    if (!check(!services.empty(), "argc > optind")) return;
    set_replay_state(services, delay, state);
}

void print_entry(const replay_state_entry& entry) {
    constexpr std::size_t name_width = 10;
    std::string name;
    if (!service_name_for_id(static_cast<std::int32_t>(entry.service_id), name))
        name = std::to_string(entry.service_id);
    text_line line;
    line.text("Service ").left(name, name_width).text(" is ");
    if (entry.state < state_names.size()) {
        line.text(state_names[entry.state]);
    } else {
        line.number(entry.state);
    }
    print_line(line.view());
}

}  // namespace

bool replay_is_enabled() {
    if (!replay_status().empty()) return true;
    print_line("Replay is not enabled");
    return false;
}

void enable(argument_words& words) {
    if (replay_is_enabled()) set_state(words, 0, replay_state::enabled);
}

void disable(argument_words& words) {
    if (replay_is_enabled()) set_state(words, 0, replay_state::loaded);
}

void schedule_enable(argument_words& words) {
    if (!replay_is_enabled()) return;
    const auto delay_word = words.take();
    if (!check(delay_word, "argc > optind")) return;
    const std::uint32_t delay = parse_low_32_bits(*delay_word, "invalid delay");
    set_state(words, delay, replay_state::enabled);
}

void show_status(argument_words& /*words*/) {
    if (!replay_is_enabled()) return;
    print_line("Replay status:");
    for (const replay_state_entry& entry : replay_status())
        print_entry(entry);
}

}  // namespace nrx::replay
