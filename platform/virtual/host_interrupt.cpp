// The interrupts of the virtual host, which are those of the process itself.

#include <algorithm>
#include <array>
#include <atomic>
#include <csignal>
#include <ctime>
#include <poll.h>
#include <unistd.h>

#include "platform/interrupt.h"
#include "platform/virtual/interrupts.h"

namespace platform {

namespace {

constexpr std::array interrupt_signals{SIGINT, SIGTERM, SIGHUP};

std::atomic<bool> pending = false;
static_assert(std::atomic<bool>::is_always_lock_free);

interrupt_handler registered_handler = nullptr;
bool serving = false;
bool served = false;  // since the handler was registered

bool is_ignored(int signal) {
    struct sigaction current {};
    ::sigaction(signal, nullptr, &current);
    return current.sa_handler == SIG_IGN;
}

// Safe inside a signal handler.
void set_signal_actions(void (*action)(int)) {
    struct sigaction new_action {};
    new_action.sa_handler = action;
    new_action.sa_flags = SA_RESTART;
    for (const int signal : interrupt_signals) {
        if (signal != SIGHUP || !is_ignored(signal)) ::sigaction(signal, &new_action, nullptr);
    }
}

extern "C" void mark_pending(int /*signal*/) {
    pending = true;
    set_signal_actions(SIG_DFL);
}

timespec to_timespec(std::chrono::nanoseconds duration) {
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(duration);
    return {.tv_sec = seconds.count(), .tv_nsec = (duration - seconds).count()};
}

// Waits for a signal that is not in the mask, or until nobody reads the standard output any more,
// which is an interrupt. A reader that is gone is noticed once: it would end every later wait.
void wait_for_signal(const timespec* timeout, const sigset_t& mask) {
    const bool watches_reader = registered_handler != nullptr && !served;
    pollfd output{watches_reader ? STDOUT_FILENO : -1, 0, 0};
    ::ppoll(&output, 1, timeout, &mask);
    if ((output.revents & (POLLERR | POLLHUP)) != 0) request_interrupt();
}

}  // namespace

void set_interrupt_handler(interrupt_handler handler) {
    registered_handler = handler;
    served = false;
    set_signal_actions(mark_pending);
}

void restore_default_interrupt() {
    set_signal_actions(SIG_DFL);
    simulated::serve_interrupt();
    registered_handler = nullptr;
}

void request_interrupt() {
    if (registered_handler != nullptr && !served) pending = true;
}

namespace simulated {

void serve_interrupt() {
    if (serving || registered_handler == nullptr || !pending.exchange(false)) return;
    served = true;
    serving = true;
    registered_handler();
    serving = false;
}

// The signals are blocked between the check and the wait, and ppoll unblocks them atomically, so
// that no interrupt is missed.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout) {
    sigset_t interrupt_mask{};
    sigset_t previous_mask{};
    ::sigemptyset(&interrupt_mask);
    for (const int signal : interrupt_signals)
        ::sigaddset(&interrupt_mask, signal);
    ::pthread_sigmask(SIG_BLOCK, &interrupt_mask, &previous_mask);
    if (!pending) {
        timespec remaining{};
        if (timeout) remaining = to_timespec(std::max(*timeout, std::chrono::nanoseconds(0)));
        wait_for_signal(timeout ? &remaining : nullptr, previous_mask);
    }
    ::pthread_sigmask(SIG_SETMASK, &previous_mask, nullptr);
}

}  // namespace simulated

}  // namespace platform
