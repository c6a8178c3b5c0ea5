// What a backend promises about the event loop.

#include "platform/run_loop.h"

#include <csignal>
#include <ctime>
#include <thread>

#include "platform/clock.h"
#include "platform/hid_plugin.h"
#include "platform/interrupt.h"
#include "platform/virtual/return_codes.h"
#include "tests/support/hid_host.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using platform::run_loop;
using platform::run_loop_for;
using platform::stop_loop;
using platform::simulated::endless_wait;

// One callback: the first byte of the record, and the time.
using seen = std::vector<std::pair<int, clock_time>>;

class event_loop : public device_test {
public:
    event_loop() = default;
    ~event_loop() override { platform::restore_default_interrupt(); }
    event_loop(const event_loop&) = delete;
    event_loop& operator=(const event_loop&) = delete;

protected:
    platform::hid_interface listen(const char* name) {
        auto device = query_hid_interface(create_hid_plugin(service_named(name)));
        const auto note = [this](platform::byte_view record) {
            called.emplace_back(record[0], host.clock().now());
            if (on_call) on_call(record[0]);
        };
        EXPECT_EQ(schedule_on_loop(device), platform::success);
        EXPECT_EQ(set_record_callback(device, note), platform::success);
        EXPECT_EQ(set_mode(device, 0, 1), platform::success);
        return device;
    }

    // Runs to the end that stop_loop brings about, and tells what was called back.
    seen stopped_run() {
        called.clear();
        EXPECT_EQ(run_loop(), platform::success);
        return called;
    }
    seen run_for(std::chrono::microseconds duration) {
        called.clear();
        EXPECT_EQ(run_loop_for(duration), platform::success);
        return called;
    }

    seen called;
    std::function<void(int)> on_call;
    scripted_records& first_records = put_hid_device(host, "first", 1);
    scripted_records& second_records = put_hid_device(host, "second", 2);
    platform::hid_interface first = listen("first");
    platform::hid_interface second = listen("second");
};

TEST_F(event_loop, calls_back_in_the_order_of_the_times_up_to_the_end_of_the_run) {
    first_records.script = {{10ms, {1}}, {30ms, {3}}, {40ms, {4}}, {1s + 1ns, {6}}};
    second_records.script = {{20ms, {2}}, {40ms, {5}}};
    EXPECT_EQ(run_for(40ms), (seen{{1, 10ms}, {2, 20ms}, {3, 30ms}, {4, 40ms}, {5, 40ms}}));
    EXPECT_EQ(run_for(960ms), seen());
    EXPECT_EQ(host.clock().now(), 1s);
    EXPECT_EQ(run_for(1ms).size(), 1U);
}

TEST_F(event_loop, stops_inside_a_callback_before_the_next_one) {
    first_records.script = {{10ms, {1}}, {10ms, {2}}, {30ms, {3}}};
    on_call = [](int record) {
        if (record != 2) stop_loop();
    };
    EXPECT_EQ(stopped_run(), (seen{{1, 10ms}}));
    EXPECT_EQ(stopped_run(), (seen{{2, 10ms}, {3, 30ms}}));
}

TEST_F(event_loop, a_stop_before_a_run_ends_that_run_alone) {
    first_records.script = {{0ms, {1}}};
    stop_loop();
    stop_loop();
    EXPECT_EQ(stopped_run(), seen());
    EXPECT_EQ(run_for(5ms), (seen{{1, 0ms}}));
}

TEST_F(event_loop, late_callbacks_are_made_but_do_not_draw_a_run_out) {
    first_records.script = {{10ms, {1}}, {20ms, {2}}, {40ms, {3}}};
    on_call = [](int) { platform::sleep(100ms); };
    EXPECT_EQ(run_for(30ms), (seen{{1, 10ms}, {2, 110ms}}));
}

TEST_F(event_loop, a_run_that_nothing_can_end_fails) {
    EXPECT_EQ(run_loop(), endless_wait);
    first_records.script = {{10ms, {1}}, {20ms, {2}}};
    second_records.script = {{15ms, {3}}};
    host.clock().plan(12ms, [&] { host.remove("first"); });
    EXPECT_EQ(run_loop(), endless_wait);
    EXPECT_EQ(called, (seen{{1, 10ms}, {3, 15ms}}));
}

TEST_F(event_loop, what_is_released_calls_back_no_more_not_even_from_its_own_callback) {
    first_records.script = {{10ms, {1}}, {20ms, {2}}};
    on_call = [&](int) { first.reset(); };
    EXPECT_EQ(run_for(1s), (seen{{1, 10ms}}));
}

TEST_F(event_loop, an_interrupt_stops_it_at_once_whenever_it_comes) {
    platform::handle_interrupt(stop_loop);
    first_records.script = {{10ms, {1}}, {20ms, {2}}, {50ms, {3}}};
    on_call = [](int record) {
        if (record == 1) std::raise(SIGINT);
    };
    EXPECT_EQ(stopped_run(), (seen{{1, 10ms}}));
    host.clock().plan(40ms, [] { std::raise(SIGINT); });
    EXPECT_EQ(stopped_run(), (seen{{2, 20ms}}));
    EXPECT_EQ(host.clock().now(), 40ms);
    std::raise(SIGINT);
    EXPECT_EQ(stopped_run(), seen());
}

// Another thread sends it while this one is blocked.
TEST_F(event_loop, a_blocked_run_uses_no_processor_time_and_wakes_for_an_interrupt) {
    host.clock().follow_host();
    platform::handle_interrupt(stop_loop);
    std::thread sender([self = ::pthread_self()] {
        std::this_thread::sleep_for(100ms);
        ::pthread_kill(self, SIGINT);
    });
    const std::clock_t before = std::clock();
    EXPECT_EQ(stopped_run(), seen());
    EXPECT_LT(std::clock() - before, CLOCKS_PER_SEC / 20);
    sender.join();
}

TEST_F(event_loop, waits_for_the_times_when_it_follows_the_host) {
    host.clock().follow_host();
    const auto start = host.clock().now();
    first_records.script = {{start + 20ms, {1}}, {start + 1h, {2}}};
    on_call = [](int) { stop_loop(); };
    ASSERT_EQ(run_for(10s).size(), 1U);
    EXPECT_GE(called[0].second - start, 20ms);
    EXPECT_LT(called[0].second - start, 5s);
}

}  // namespace

}  // namespace tests
