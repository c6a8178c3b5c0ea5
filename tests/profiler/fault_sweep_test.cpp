// Every operation of the profiler family survives the failure of any platform call.

#include "tests/support/fault_sweep.h"

#include "nrxctl/base/tick_period.h"
#include "nrxctl/profiler/profile_command.h"
#include "nrxctl/profiler/scm_monitor.h"
#include "platform/clock.h"
#include "platform/virtual/profiler/profiler.h"
#include "tests/support/device_test.h"
#include "tests/support/word_vector.h"

namespace tests {

namespace {

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    serve_profile(put_service(*host, "profile", 1), add_profiler_driver(*host));
    return host;
}

using family_command = void (*)(std::string_view, std::span<char* const>, int&);

// Sweeps a command with its first argument and its further words.
void sweep(family_command command, const std::string& words,
           const std::function<bool(const fault&)>& acceptable) {
    const word_vector all(split(words));
    const auto operation = [&] {
        int index = 1;
        command(all.all()[0], all.all(), index);
    };
    sweep_faults(make_host, operation, acceptable);
}

// Look-ups that only probe for a half of the profiler say nothing when they fail, nor do those of a
// record's times; a sleep cannot be missed.
bool is_a_probe(const fault& one) {
    for (const char* probe : {"IONameMatch = \"WQR_", "IONameMatch = \"profile\"", "sleep ",
                              "data available ", "KeltoNRXTimesync", "boot time"}) {
        if (one.name.find(probe) != std::string::npos) return true;
    }
    return false;
}

// An unsupported configuration is announced instead.
bool is_announced(const fault& one) {
    return one.result.out.find("config: At least one config failed") != std::string::npos ||
           one.result.out.find("Can't enable SCM profiler") != std::string::npos;
}

bool is_reported_or_foreseen(const fault& one) {
    return !one.result.err.empty() || one.how == failure::nothing || is_a_probe(one) ||
           is_announced(one);
}

// "get-config" shows what it cannot read as nothing active.
bool is_reported_or_shown_as_none(const fault& one) {
    return is_reported_or_foreseen(one) || one.result.out.find("    none\n") != std::string::npos;
}

// "signal-errdump" and the driver's log are silent without a driver.
bool is_reported_or_without_driver(const fault& one) {
    return is_reported_or_foreseen(one) ||
           one.name.find("IONameMatch = \"KeltoNRXProfileDriver\"") != std::string::npos;
}

}  // namespace

TEST(profiler_fault_sweep, subcommands_report_every_failure_that_is_no_probe) {
    for (const char* words : {"clear-eventsources", "eventsources", "wqrfw-wakestats", "enable",
                              "disable", "on-error panic"}) {
        // The first of the two look-ups of a service by name may find nothing.
        sweep(nrx::profile_command, words, [](const fault& one) {
            return !one.result.err.empty() || one.how == failure::nothing || one.call == 1;
        });
    }
    for (const char* words : {"stop", "flush", "config sensor:accel"})
        sweep(nrx::profile_command, words, is_reported_or_foreseen);
    sweep(nrx::profile_command, "get-config", is_reported_or_shown_as_none);
    for (const char* words : {"signal-errdump", "get-logs errdump fwdump", "get-logs human"})
        sweep(nrx::profile_command, words, is_reported_or_without_driver);
}

TEST(profiler_fault_sweep, monitors_report_end_and_leave_nothing_open) {
    nrx::tick_period = platform::tick_period();
    for (const char* words : {"40 sensor:accel", "monitor human 40"})
        sweep(nrx::profile_command, words, is_reported_or_foreseen);
    sweep(nrx::scm_monitor, "40 scm:spi0:ch0", is_reported_or_foreseen);
}

}  // namespace tests
