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
protected:
    void SetUp() override {
        device_test::SetUp();
        first = listen("first", 1, first_records);
        second = listen("second", 2, second_records);
    }
    void TearDown() override {
        platform::restore_default_interrupt();
        first.reset();
        second.reset();
        device_test::TearDown();
    }

    platform::hid_interface listen(const char* name, std::int32_t location,
                                   scripted_records*& records) {
        records = &put_hid_device(host, name, location);
        auto device =
            query_hid_interface(create_hid_plugin(platform::first_match({{"IONameMatch", name}})));
        EXPECT_EQ(schedule_on_loop(device), platform::success);
        EXPECT_EQ(set_record_callback(device,
                                      [this](platform::byte_view record) {
                                          called.emplace_back(record[0], host.clock().now());
                                          if (on_call) on_call(record[0]);
                                      }),
                  platform::success);
        EXPECT_EQ(set_mode(device, location, 1), platform::success);
        return device;
    }

    scripted_records* first_records = nullptr;
    scripted_records* second_records = nullptr;
    platform::hid_interface first;
    platform::hid_interface second;
    seen called;
    std::function<void(int)> on_call;
};

TEST_F(event_loop, calls_back_in_the_order_of_the_times) {
    first_records->script = {{10ms, {1}}, {30ms, {3}}, {40ms, {4}}};
    second_records->script = {{20ms, {2}}, {40ms, {5}}};
    EXPECT_EQ(run_loop_for(1s), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}, {2, 20ms}, {3, 30ms}, {4, 40ms}, {5, 40ms}}));
    EXPECT_EQ(host.clock().now(), 1s);
}

TEST_F(event_loop, stops_inside_a_callback_before_the_next_one) {
    first_records->script = {{10ms, {1}}, {10ms, {2}}, {30ms, {3}}};
    on_call = [](int record) {
        if (record != 2) stop_loop();
    };
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}}));
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}, {2, 10ms}, {3, 30ms}}));
}

TEST_F(event_loop, a_stop_before_a_run_ends_that_run_alone) {
    first_records->script = {{0ms, {1}}};
    stop_loop();
    stop_loop();
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_TRUE(called.empty());
    EXPECT_EQ(run_loop_for(5ms), platform::success);
    EXPECT_EQ(called, (seen{{1, 0ms}}));
    on_call = [](int) { stop_loop(); };
    first_records->script = {{5ms, {2}}};
    EXPECT_EQ(run_loop_for(0ms), platform::success);
    EXPECT_EQ(called.size(), 2U);
}

TEST_F(event_loop, a_stop_ends_the_innermost_run_alone) {
    first_records->script = {{0ms, {1}}};
    on_call = [](int) {
        stop_loop();
        EXPECT_EQ(run_loop_for(1s), platform::success);
    };
    EXPECT_EQ(run_loop_for(20ms), platform::success);
    EXPECT_EQ(host.clock().now(), 20ms);
}

TEST_F(event_loop, runs_for_a_time_with_what_comes_about_at_its_end) {
    first_records->script = {{10ms, {1}}, {20ms, {2}}, {20ms + 1ns, {3}}};
    EXPECT_EQ(run_loop_for(20ms), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}, {2, 20ms}}));
    EXPECT_EQ(host.clock().now(), 20ms);
    EXPECT_EQ(run_loop_for(1ms), platform::success);
    EXPECT_EQ(called.size(), 3U);
}

TEST_F(event_loop, late_callbacks_are_made_but_do_not_draw_a_run_out) {
    first_records->script = {{10ms, {1}}, {20ms, {2}}, {40ms, {3}}};
    on_call = [](int) { platform::sleep(100ms); };
    EXPECT_EQ(run_loop_for(30ms), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}, {2, 110ms}}));
}

TEST_F(event_loop, a_run_that_nothing_can_end_fails) {
    EXPECT_EQ(run_loop(), endless_wait);
    first_records->script = {{10ms, {1}}, {20ms, {2}}};
    second_records->script = {{15ms, {3}}};
    host.clock().plan(12ms, [&] { host.remove("first"); });
    EXPECT_EQ(run_loop(), endless_wait);
    EXPECT_EQ(called, (seen{{1, 10ms}, {3, 15ms}}));
}

TEST_F(event_loop, what_is_released_calls_back_no_more_not_even_from_its_own_callback) {
    first_records->script = {{10ms, {1}}, {20ms, {2}}};
    on_call = [&](int) { first.reset(); };
    EXPECT_EQ(run_loop(), endless_wait);
    EXPECT_EQ(called, (seen{{1, 10ms}}));
}

TEST_F(event_loop, what_is_scheduled_twice_calls_back_once) {
    first_records->script = {{10ms, {1}}};
    EXPECT_EQ(schedule_on_loop(first), platform::success);
    EXPECT_EQ(run_loop_for(50ms), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}}));
}

TEST_F(event_loop, an_interrupt_stops_it_at_once_whenever_it_comes) {
    platform::handle_interrupt(stop_loop);
    first_records->script = {{10ms, {1}}, {20ms, {2}}, {50ms, {3}}};
    on_call = [](int record) {
        if (record == 1) std::raise(SIGINT);
    };
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_EQ(called, (seen{{1, 10ms}}));
    host.clock().plan(40ms, [] { std::raise(SIGINT); });
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_EQ(host.clock().now(), 40ms);
    std::raise(SIGINT);
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_EQ(called.size(), 2U);
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
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_LT(std::clock() - before, CLOCKS_PER_SEC / 20);
    sender.join();
}

TEST_F(event_loop, waits_for_the_times_when_it_follows_the_host) {
    host.clock().follow_host();
    const auto start = host.clock().now();
    first_records->script = {{start + 20ms, {1}}, {start + 1h, {2}}};
    on_call = [](int) { stop_loop(); };
    EXPECT_EQ(run_loop_for(10s), platform::success);
    ASSERT_EQ(called.size(), 1U);
    EXPECT_GE(called[0].second - start, 20ms);
    EXPECT_LT(called[0].second - start, 5s);
}

TEST_F(event_loop, every_run_can_be_made_to_fail) {
    host.fail_call(1, failure::io);
    EXPECT_EQ(run_loop(), platform::simulated::io_failure);
    host.fail_call(1, failure::no_memory);
    EXPECT_EQ(run_loop_for(1s), platform::no_memory);
    host.fail_call(1, failure::nothing);
    EXPECT_EQ(run_loop(), platform::success);
    EXPECT_EQ(host.clock().now(), 0ms);
    EXPECT_EQ(logged("run"),
              (std::vector<std::string>{"run loop", "run loop for 1000000 us", "run loop"}));
}

}  // namespace

}  // namespace tests
