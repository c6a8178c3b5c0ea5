// Every operation of the profiler family survives the failure of any platform call.

#include "tests/support/fault_sweep.h"

#include "nrxctl/base/tick_period.h"
#include "nrxctl/profiler/profile_command.h"
#include "nrxctl/profiler/scm_monitor.h"
#include "platform/clock.h"
#include "platform/virtual/profiler/profiler.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

namespace {

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    serve_profile(put_service(*host, "profile", 1), add_profiler_driver(*host));
    return host;
}

using family_command = void (*)(std::string_view, std::span<char* const>, int&);

// Sweeps a command with its first argument and its further words.
void sweep(family_command command, const std::vector<std::string>& words,
           const std::function<bool(const fault&)>& acceptable) {
    const auto operation = [&] {
        std::vector<std::string> copies = words;
        std::vector<char*> argv;
        for (std::string& word : copies)
            argv.push_back(word.data());
        int index = 1;
        command(copies[0], argv, index);
    };
    sweep_faults(make_host, operation, acceptable);
}

// A failure that says nothing is one of a call that succeeds with nothing, of a probe that may
// fail, or of a sleep, which no one can miss.
bool is_reported_or_foreseen(const fault& one) {
    return !one.result.err.empty() || one.how == failure::nothing || !one.result.out.empty();
}

}  // namespace

TEST(profiler_fault_sweep, subcommands_report_every_failure) {
    const std::vector<std::vector<std::string>> subcommands{
        {"clear-eventsources"}, {"eventsources"}, {"wqrfw-wakestats"}, {"enable"}, {"disable"},
        {"on-error", "panic"},
    };
    for (const auto& words : subcommands) {
        // The first of the two look-ups of a service by name may find nothing.
        sweep(nrx::profile_command, words, [](const fault& one) {
            return !one.result.err.empty() || one.how == failure::nothing || one.call == 1;
        });
    }
}

TEST(profiler_fault_sweep, probing_subcommands_end) {
    const std::vector<std::vector<std::string>> subcommands{
        {"stop"},
        {"flush"},
        {"get-config"},
        {"get-logs", "errdump", "fwdump"},
        {"config", "sensor:accel"},
        {"signal-errdump"},
    };
    for (const auto& words : subcommands) {
        sweep(nrx::profile_command, words,
              [](const fault& one) { return !one.result.status.has_value(); });
    }
}

TEST(profiler_fault_sweep, monitors_end_and_leave_nothing_open) {
    nrx::tick_period = platform::tick_period();
    sweep(nrx::profile_command, {"40", "sensor:accel"}, is_reported_or_foreseen);
    sweep(nrx::scm_monitor, {"40", "scm:spi0:ch0"}, is_reported_or_foreseen);
}

}  // namespace tests
