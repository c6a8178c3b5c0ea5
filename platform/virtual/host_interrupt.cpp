// The interrupt signal of the virtual host, which is the signal of the process itself.

#include <algorithm>
#include <atomic>
#include <csignal>
#include <ctime>
#include <poll.h>

#include "platform/interrupt.h"
#include "platform/virtual/interrupts.h"

namespace platform {

namespace {

std::atomic<bool> pending = false;
static_assert(std::atomic<bool>::is_always_lock_free);

interrupt_handler registered_handler = nullptr;
bool serving = false;

extern "C" void mark_pending(int /*signal*/) {
    pending = true;
}

void set_signal_action(void (*action)(int)) {
    struct sigaction new_action {};
    new_action.sa_handler = action;
    new_action.sa_flags = SA_RESTART;
    ::sigaction(SIGINT, &new_action, nullptr);
}

timespec to_timespec(std::chrono::nanoseconds duration) {
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(duration);
    return {.tv_sec = seconds.count(), .tv_nsec = (duration - seconds).count()};
}

}  // namespace

void set_interrupt_handler(interrupt_handler handler) {
    registered_handler = handler;
    set_signal_action(mark_pending);
}

void restore_default_interrupt() {
    set_signal_action(SIG_DFL);
    simulated::serve_interrupt();
    registered_handler = nullptr;
}

namespace simulated {

void serve_interrupt() {
    if (serving || registered_handler == nullptr) return;
    serving = true;
    while (pending.exchange(false))
        registered_handler();
    serving = false;
}

// The signal is blocked between the check and the wait, and ppoll unblocks it atomically, so that
// no interrupt is missed.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout) {
    sigset_t interrupt_mask{};
    sigset_t previous_mask{};
    ::sigemptyset(&interrupt_mask);
    ::sigaddset(&interrupt_mask, SIGINT);
    ::pthread_sigmask(SIG_BLOCK, &interrupt_mask, &previous_mask);
    if (!pending) {
        timespec remaining{};
        if (timeout) remaining = to_timespec(std::max(*timeout, std::chrono::nanoseconds(0)));
        ::ppoll(nullptr, 0, timeout ? &remaining : nullptr, &previous_mask);
    }
    ::pthread_sigmask(SIG_SETMASK, &previous_mask, nullptr);
}

}  // namespace simulated

}  // namespace platform
