#include "nrxctl/inspection/hid_event_watch.h"

#include <csignal>

#include "platform/interrupt.h"
#include "platform/run_loop.h"
#include "tests/inspection/event_host.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using lines = std::vector<std::string>;

class hid_event_watch : public event_test {
protected:
    hid_event_watch() {
        put_hid_events(host, {{1s, event_at(0.75, 0)},
                              {2s, platform::simulated::hid_reset{}},
                              {3s, byte_list{0, 1, 57, 0, 0, 0, 0}},
                              {4s, event_at(3.75, 5)},
                              {5s, event_at(4.75, platform::accelerometer_event)},
                              {5s, vendor_event_at(4.875, "beat")},
                              {6s, event_at(5.75, 0)}});
    }
};

TEST_F(hid_event_watch, prints_what_the_event_system_tells_for_a_time) {
    EXPECT_EQ(capture([] { EXPECT_EQ(nrx::watch_hid_events(5s), platform::success); }).out,
              "[null] 0 ∂=0.75 latency: 0\n"
              "ResetCallback 0x1 0 services: 0x2\n"
              "TALY_CALLBACK: clear com.kelto.wqr.test\n"
              "type: 5latency: 0 µs\n"
              "[accelerometer] 4.000000 ∂=1.000000 latency: 0.000000 "
              "0.000000, 0.000000, 0.000000 [0/0] 0\n"
              "now: 120.000000  ts: 4.875000    delta: 115.125000 \t 'beat' \t wall: 4.875000   "
              " delta:            4.875000 <-------------------------------\n");
    EXPECT_EQ(host.clock().now(), 5s);
    EXPECT_EQ(host.log(),
              (lines{"create hid event client", "set event callback", "set reset callback",
                     "set statistics callback", "schedule hid event client",
                     "run loop for 5000000 us", "services of hid event client",
                     "release list of 0 hid services", "release hid event client"}));
}

TEST_F(hid_event_watch, without_a_time_lasts_until_the_loop_is_stopped) {
    platform::handle_interrupt(platform::stop_loop);
    host.clock().plan(3500ms, [] { std::raise(SIGINT); });
    const auto result =
        capture([] { EXPECT_EQ(nrx::watch_hid_events(std::nullopt), platform::success); });
    platform::restore_default_interrupt();
    EXPECT_TRUE(result.out.ends_with("TALY_CALLBACK: clear com.kelto.wqr.test\n"));
    EXPECT_EQ(host.clock().now(), 3500ms);
    EXPECT_EQ(logged("run"), lines{"run loop"});
}

TEST_F(hid_event_watch, ends_at_the_step_that_fails) {
    const char* file = "inspection/hid_event_watch.cpp";
    const auto watch = [] { return nrx::watch_hid_events(5s); };
    host.fail_call(1, failure::io);
    EXPECT_EQ(reported(platform::not_found, watch), failed(file, "client"));
    for (std::size_t call = 2; call <= 6; ++call) {
        const std::size_t made = host.calls_made();
        host.fail_call(call, failure::io);
        EXPECT_EQ(reported(platform::simulated::io_failure, watch),
                  failed(file, "kr == 0 ", io_text));
        EXPECT_EQ(host.calls_made() - made, call);
    }
}

}  // namespace

}  // namespace tests
