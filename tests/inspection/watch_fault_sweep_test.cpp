// The watches survive the failure of any platform call.

#include "nrxctl/inspection/hid_event_watch.h"
#include "nrxctl/inspection/spi_watch.h"
#include "platform/run_loop.h"
#include "tests/support/fault_sweep.h"
#include "tests/support/hid_host.h"
#include "tests/support/report_bytes.h"

namespace tests {

namespace {

using namespace std::chrono_literals;

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    auto& records = put_hid_device(*host, "accel-hid", 16);
    records.script = {{10ms, report_with(9, {{8, 1, 1}})}};
    put_hid_events(*host, {{10ms, platform::simulated::hid_reset{}}});
    host->clock().plan(20ms, platform::stop_loop);
    return host;
}

// A step that succeeds with nothing done is no failure, nor are services that are not listed.
bool is_reported(const fault& one) {
    const auto is_of = [&](const char* call) { return one.name.starts_with(call); };
    const bool is_step = is_of("schedule ") || is_of("set ") || is_of("run loop");
    const bool has_no_list = is_of("services of ") && one.result.out.ends_with(" services: 0\n");
    return !one.result.err.empty() || (is_step && one.how == failure::nothing) || has_no_list;
}

}  // namespace

TEST(watch_fault_sweep, spi_status) {
    for (const std::uint32_t mode : {0U, 1U}) {
        sweep_faults(
            make_host, [&] { nrx::watch_spi_status(16, mode); }, is_reported);
    }
}

TEST(watch_fault_sweep, hid_events) {
    sweep_faults(
        make_host, [] { nrx::watch_hid_events(std::nullopt); }, is_reported);
}

}  // namespace tests
