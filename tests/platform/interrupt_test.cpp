// What a backend promises about clocks and interrupts.

#include "platform/interrupt.h"

#include <csignal>
#include <ctime>
#include <thread>

#include "platform/clock.h"
#include "platform/virtual/interrupts.h"
#include "tests/platform/queue_host.h"

namespace tests {

using namespace std::chrono_literals;

namespace {

int handled = 0;
std::function<void()> on_handle;

void count_interrupt() {
    ++handled;
    if (on_handle) on_handle();
}

bool has_default_action() {
    struct sigaction current {};
    ::sigaction(SIGINT, nullptr, &current);
    return current.sa_handler == SIG_DFL;
}

}  // namespace

class interrupt : public queue_test {
public:
    interrupt() {
        handled = 0;
        on_handle = nullptr;
        platform::handle_interrupt(count_interrupt);
    }
    ~interrupt() override {
        platform::restore_default_interrupt();
        EXPECT_TRUE(has_default_action());
    }
    interrupt(const interrupt&) = delete;
    interrupt& operator=(const interrupt&) = delete;
};

TEST_F(interrupt, is_handled_once_when_a_platform_call_returns_and_not_before) {
    std::raise(SIGINT);
    std::raise(SIGINT);
    EXPECT_EQ(handled, 0);
    EXPECT_FALSE(service_named("nobody"));
    EXPECT_EQ(handled, 1);
    EXPECT_FALSE(service_named("nobody"));
    EXPECT_EQ(handled, 1);
}

TEST_F(interrupt, inside_its_own_handler_is_handled_after_that) {
    on_handle = [] {
        if (handled > 1) return;
        std::raise(SIGINT);
        EXPECT_FALSE(service_named("nobody"));
        EXPECT_EQ(handled, 1);
    };
    std::raise(SIGINT);
    EXPECT_FALSE(service_named("nobody"));
    EXPECT_EQ(handled, 2);
}

TEST_F(interrupt, noted_before_the_default_action_is_back_is_still_handled) {
    std::raise(SIGINT);
    platform::restore_default_interrupt();
    EXPECT_EQ(handled, 1);
    EXPECT_TRUE(has_default_action());
}

TEST_F(interrupt, before_a_wait_is_not_missed_by_it) {
    auto& shared = stream();
    host.clock().follow_host();
    on_handle = [&] { shared.add({1}); };
    host.before_call(1, [] { std::raise(SIGINT); });
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::success);
    EXPECT_EQ(handled, 1);
}

TEST_F(interrupt, that_is_not_served_yet_lets_nothing_block) {
    host.clock().follow_host();
    std::raise(SIGINT);
    platform::simulated::await_interrupt(std::nullopt);
    EXPECT_EQ(handled, 0);
    platform::simulated::serve_interrupt();
    platform::simulated::await_interrupt(1ms);
    EXPECT_EQ(handled, 1);
    sigset_t held_back{};
    ::pthread_sigmask(SIG_SETMASK, nullptr, &held_back);
    EXPECT_FALSE(::sigismember(&held_back, SIGINT));
}

TEST_F(interrupt, inside_a_sleep_is_handled_at_once_and_the_sleep_goes_on) {
    on_handle = [&] { EXPECT_EQ(host.clock().now(), 30ms); };
    host.clock().plan(30ms, [] { std::raise(SIGINT); });
    platform::sleep(100ms);
    EXPECT_EQ(handled, 1);
    EXPECT_EQ(host.clock().now(), 100ms);
}

// Another thread sends it while this one is blocked, and wakes it without help of the clock.
TEST_F(interrupt, wakes_a_blocked_wait_which_uses_no_processor_time) {
    auto& shared = stream();
    host.clock().follow_host();
    on_handle = [&] { shared.add({1}); };
    std::thread sender([self = ::pthread_self()] {
        std::this_thread::sleep_for(100ms);
        ::pthread_kill(self, SIGINT);
    });
    const std::clock_t before = std::clock();
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::success);
    EXPECT_LT(std::clock() - before, CLOCKS_PER_SEC / 20);
    sender.join();
    EXPECT_EQ(handled, 1);
}

using host_clock = device_test;

TEST_F(host_clock, reads_the_same_instant_on_both_clocks_and_sleeps_as_long_as_asked) {
    host.clock().set_wall_start(1'700'000'000'250'000us);
    platform::sleep(1'500'000us);
    const auto reading = platform::read_clocks();
    EXPECT_EQ(reading.ticks, platform::ticks());
    EXPECT_EQ(reading.wall.seconds, 1'700'000'001);
    EXPECT_EQ(reading.wall.microseconds, 750'000);
    host.clock().follow_host();
    const auto before = std::chrono::system_clock::now().time_since_epoch();
    const auto wall = platform::read_clocks().wall;
    const auto told = std::chrono::seconds(wall.seconds) + wall.microseconds * 1us;
    EXPECT_GE(told, before - 1s);
    EXPECT_LT(told, before + 10s);
    const auto steady_before = std::chrono::steady_clock::now();
    const auto ticks_before = platform::ticks();
    platform::sleep(20ms);
    EXPECT_GE(std::chrono::steady_clock::now() - steady_before, 20ms);
    EXPECT_GE(static_cast<double>(platform::ticks() - ticks_before) * platform::tick_period(),
              0.0199);
}

}  // namespace tests
