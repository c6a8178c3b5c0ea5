// The contract of clocks, interrupts and the event loop.

#include "platform/run_loop.h"

#include <csignal>
#include <functional>
#include <thread>

#include "platform/clock.h"
#include "platform/hid_plugin.h"
#include "platform/interrupt.h"
#include "platform/virtual/interrupts.h"
#include "platform/virtual/return_codes.h"
#include "tests/platform/platform_test.h"
#include "tests/support/hid_host.h"

namespace tests {

using namespace platform;
using namespace std::chrono_literals;

namespace {

int handled = 0;
std::function<void()> on_handle;

void count_interrupt() {
    ++handled;
    if (on_handle) on_handle();
}

using action = void (*)(int);

action action_of(int signal) {
    struct sigaction current {};
    ::sigaction(signal, nullptr, &current);
    return current.sa_handler;
}

bool has_default_action() {
    return action_of(SIGINT) == SIG_DFL && action_of(SIGTERM) == SIG_DFL &&
           action_of(SIGHUP) == SIG_DFL;
}

}  // namespace

class interrupts : public queue_test {
protected:
    void SetUp() override {
        handled = 0;
        on_handle = nullptr;
        set_interrupt_handler(count_interrupt);
    }
    void TearDown() override { restore_default_interrupt(); }
};

TEST_F(interrupts, of_each_kind_are_handled_once_when_a_call_returns) {
    const std::vector<std::function<void()>> kinds{
        [] { std::raise(SIGINT); }, [] { std::raise(SIGTERM); }, [] { std::raise(SIGHUP); },
        [] {
            request_interrupt();
            request_interrupt();
        }};
    for (const auto& interrupt : kinds) {
        set_interrupt_handler(count_interrupt);
        handled = 0;
        interrupt();
        EXPECT_EQ(handled, 0);
        service_named("nobody");
        EXPECT_EQ(handled, 1);
        request_interrupt();  // too late: the handler has run
        service_named("nobody");
        EXPECT_EQ(handled, 1);
    }
}

// One request may signal twice; the user repeats it later.
TEST_F(interrupts, repeated_at_once_are_one_and_later_end_the_process) {
    std::raise(SIGTERM);
    std::raise(SIGINT);
    service_named("nobody");
    EXPECT_EQ(handled, 1);
    restore_default_interrupt();
    std::raise(SIGHUP);
    service_named("nobody");
    EXPECT_EQ(handled, 1);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        EXPECT_EXIT(
            {
                set_interrupt_handler(count_interrupt);
                std::raise(SIGINT);
                std::this_thread::sleep_for(400ms);  // as much as a user would take
                std::raise(signal);
            },
            testing::KilledBySignal(signal), "");
    }
}

TEST_F(interrupts, have_their_default_actions_without_a_handler) {
    EXPECT_FALSE(has_default_action());
    restore_default_interrupt();
    EXPECT_TRUE(has_default_action());
    set_interrupt_handler(count_interrupt);
    EXPECT_FALSE(interrupt_received());
    request_interrupt();
    EXPECT_TRUE(interrupt_received());
    service_named("nobody");
    EXPECT_TRUE(interrupt_received());
    restore_default_interrupt();
    EXPECT_FALSE(interrupt_received());
    EXPECT_EQ(handled, 1);
    EXPECT_TRUE(has_default_action());
}

TEST_F(interrupts, leave_an_ignored_hang_up_ignored) {
    restore_default_interrupt();
    std::signal(SIGHUP, SIG_IGN);
    set_interrupt_handler(count_interrupt);
    EXPECT_EQ(action_of(SIGHUP), SIG_IGN);
    std::raise(SIGTERM);
    EXPECT_EQ(action_of(SIGHUP), SIG_IGN);
    restore_default_interrupt();
    EXPECT_EQ(action_of(SIGHUP), SIG_IGN);
    std::signal(SIGHUP, SIG_DFL);
}

TEST_F(interrupts, requested_inside_the_handler_or_without_one_have_no_effect) {
    on_handle = [] {
        request_interrupt();
        service_named("nobody");
    };
    request_interrupt();
    service_named("nobody");
    EXPECT_EQ(handled, 1);
    restore_default_interrupt();
    request_interrupt();
    set_interrupt_handler(count_interrupt);
    service_named("nobody");
    EXPECT_EQ(handled, 1);
}

TEST_F(interrupts, if_pending_are_handled_before_the_default_is_restored) {
    std::raise(SIGINT);
    restore_default_interrupt();
    EXPECT_EQ(handled, 1);
}

TEST_F(interrupts, if_pending_prevent_blocking) {
    std::raise(SIGINT);
    simulated::await_interrupt(std::nullopt);
    EXPECT_EQ(handled, 0);
    sigset_t blocked{};
    ::pthread_sigmask(SIG_SETMASK, nullptr, &blocked);
    EXPECT_FALSE(::sigismember(&blocked, SIGINT));
}

TEST_F(interrupts, during_a_sleep_are_handled_at_once) {
    on_handle = [&] { EXPECT_EQ(host.clock().now(), 30ms); };
    host.clock().run_at(30ms, [] { std::raise(SIGINT); });
    sleep(100ms);
    EXPECT_EQ(handled, 1);
    EXPECT_EQ(host.clock().now(), 100ms);
}

TEST_F(interrupts, raised_before_a_wait_are_not_missed) {
    shared_queue& shared = connect_streamer();
    host.clock().follow_host();
    on_handle = [&] { shared.add({1}); };
    host.before_call(1, [] { std::raise(SIGINT); });
    EXPECT_EQ(wait_for_data(queue, port), success);
    EXPECT_EQ(handled, 1);
}

using host_clocks = device_test;

TEST_F(host_clocks, read_the_same_instant_and_sleep_the_whole_duration) {
    host.clock().set_wall_start(1'700'000'000'250'000us);
    sleep(1'500'000us);
    const auto reading = read_clocks();
    EXPECT_EQ(reading.ticks, ticks());
    EXPECT_EQ(reading.wall.seconds, 1'700'000'001);
    EXPECT_EQ(reading.wall.microseconds, 750'000);
    host.clock().follow_host();
    const auto steady_before = std::chrono::steady_clock::now();
    const auto ticks_before = ticks();
    sleep(20ms);
    EXPECT_GE(std::chrono::steady_clock::now() - steady_before, 20ms);
    EXPECT_GE(static_cast<double>(ticks() - ticks_before) * tick_period(), 0.0199);
}

// Callbacks: the first byte of the record, and the time.
using callbacks = std::vector<std::pair<int, clock_time>>;

class event_loops : public device_test {
protected:
    void TearDown() override { restore_default_interrupt(); }

    hid_interface listen(const char* name) {
        auto device = query_hid_interface(create_hid_plugin(service_named(name)));
        const auto on_record = [this](byte_view record) {
            made.emplace_back(record[0], host.clock().now());
            if (on_call) on_call(record[0]);
        };
        EXPECT_EQ(schedule_on_loop(device), success);
        EXPECT_EQ(set_record_callback(device, on_record), success);
        EXPECT_EQ(set_mode(device, 0, 1), success);
        return device;
    }

    // Runs the loop, until it is stopped or for a duration, and returns the callbacks made.
    callbacks run(return_code expected = success) {
        made.clear();
        EXPECT_EQ(run_loop(), expected);
        return made;
    }
    callbacks run_for(std::chrono::microseconds duration) {
        made.clear();
        EXPECT_EQ(run_loop_for(duration), success);
        return made;
    }

    callbacks made;
    std::function<void(int)> on_call;
    scripted_records& first_records = add_hid_device(host, "first", 1);
    scripted_records& second_records = add_hid_device(host, "second", 2);
    hid_interface first = listen("first");
    hid_interface second = listen("second");
};

TEST_F(event_loops, call_back_in_the_order_of_due_times) {
    first_records.script = {{10ms, {1}}, {30ms, {3}}, {40ms, {4}}, {1s + 1ns, {6}}};
    second_records.script = {{20ms, {2}}, {40ms, {5}}};
    EXPECT_EQ(run_for(40ms), (callbacks{{1, 10ms}, {2, 20ms}, {3, 30ms}, {4, 40ms}, {5, 40ms}}));
    EXPECT_EQ(run_for(960ms), callbacks());
    EXPECT_EQ(host.clock().now(), 1s);
    EXPECT_EQ(run_for(1ms).size(), 1U);
}

TEST_F(event_loops, stop_one_run_before_the_next_callback) {
    first_records.script = {{10ms, {1}}, {10ms, {2}}, {30ms, {3}}};
    on_call = [](int record) {
        if (record != 2) stop_loop();
    };
    stop_loop();
    stop_loop();
    EXPECT_EQ(run(), callbacks());
    EXPECT_EQ(run(), (callbacks{{1, 10ms}}));
    EXPECT_EQ(run(), (callbacks{{2, 10ms}, {3, 30ms}}));
}

TEST_F(event_loops, are_not_prolonged_by_late_callbacks) {
    first_records.script = {{10ms, {1}}, {20ms, {2}}, {40ms, {3}}};
    on_call = [](int) { sleep(100ms); };
    EXPECT_EQ(run_for(30ms), (callbacks{{1, 10ms}, {2, 110ms}}));
}

TEST_F(event_loops, fail_if_nothing_can_end_the_run) {
    EXPECT_EQ(run(simulated::deadlock), callbacks());
    first_records.script = {{10ms, {1}}, {20ms, {2}}};
    second_records.script = {{15ms, {3}}};
    host.clock().run_at(12ms, [&] { host.remove("first"); });
    EXPECT_EQ(run(simulated::deadlock), (callbacks{{1, 10ms}, {3, 15ms}}));
}

TEST_F(event_loops, do_not_call_back_a_released_source) {
    first_records.script = {{10ms, {1}}, {20ms, {2}}};
    on_call = [&](int) { first.reset(); };
    EXPECT_EQ(run_for(1s), (callbacks{{1, 10ms}}));
}

TEST_F(event_loops, are_stopped_by_an_interrupt_at_any_time) {
    set_interrupt_handler(stop_loop);
    first_records.script = {{10ms, {1}}, {20ms, {2}}, {50ms, {3}}};
    on_call = [](int record) {
        if (record == 1) std::raise(SIGINT);
    };
    EXPECT_EQ(run(), (callbacks{{1, 10ms}}));
    set_interrupt_handler(stop_loop);
    host.clock().run_at(40ms, [] { std::raise(SIGINT); });
    EXPECT_EQ(run(), (callbacks{{2, 20ms}}));
    EXPECT_EQ(host.clock().now(), 40ms);
    set_interrupt_handler(stop_loop);
    std::raise(SIGINT);
    EXPECT_EQ(run(), callbacks());
}

}  // namespace tests
