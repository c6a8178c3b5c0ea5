// The interrupts of the virtual host, which are those of the process itself.

#include <algorithm>
#include <array>
#include <atomic>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdint>
#include <ctime>
#include <poll.h>
#include <unistd.h>

#include "platform/interrupt.h"
#include "platform/virtual/interrupts.h"

namespace platform {

namespace {

using std::chrono::nanoseconds;

constexpr std::array interrupt_signals{SIGINT, SIGTERM, SIGHUP};

// One request may signal twice: a program and then its process group, or the terminal and the
// shell.
constexpr nanoseconds repeat_interval = std::chrono::milliseconds(300);

std::atomic<bool> pending = false;    // the handler is to run
std::atomic<bool> accepting = false;  // the next signal is the first since a handler was set
std::atomic<nanoseconds::rep> accepted_at = 0;
static_assert(std::atomic<bool>::is_always_lock_free);
static_assert(std::atomic<nanoseconds::rep>::is_always_lock_free);

interrupt_handler registered_handler = nullptr;
bool serving = false;
bool handler_has_run = false;  // since it was registered
bool output_is_closed = false;

// Safe inside a signal handler.
nanoseconds host_time() {
    timespec now{};
    ::clock_gettime(CLOCK_MONOTONIC, &now);
    return std::chrono::seconds(now.tv_sec) + nanoseconds(now.tv_nsec);
}

// Returns true if a signal was accepted so short a time ago that another one repeats it.
bool is_repeated() {
    const nanoseconds::rep accepted = accepted_at;
    return accepted != 0 && host_time().count() - accepted < repeat_interval.count();
}

bool is_ignored(int signal) {
    struct sigaction current {};
    ::sigaction(signal, nullptr, &current);
    return current.sa_handler == SIG_IGN;
}

void set_signal_actions(void (*action)(int)) {
    struct sigaction new_action {};
    new_action.sa_handler = action;
    for (const int signal : interrupt_signals) {
        if (signal != SIGHUP || !is_ignored(signal)) ::sigaction(signal, &new_action, nullptr);
    }
}

extern "C" void receive_signal(int signal) {
    const int previous_errno = errno;
    if (accepting.exchange(false)) {
        accepted_at = host_time().count();
        pending = true;
    } else if (!is_repeated()) {
        set_signal_actions(SIG_DFL);
        std::raise(signal);  // ends the process when this function returns
    }
    errno = previous_errno;
}

timespec to_timespec(nanoseconds duration) {
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(duration);
    return {.tv_sec = seconds.count(), .tv_nsec = (duration - seconds).count()};
}

// Waits for a signal that is not in the mask, or until nobody reads the standard output any more,
// which is an interrupt. A lost reader is noticed once, and closed output is not watched: both
// would end every later wait.
void wait_for_signal_or_lost_reader(const timespec* timeout, const sigset_t& mask) {
    const bool watches_reader = registered_handler != nullptr && !handler_has_run;
    pollfd output{watches_reader && !output_is_closed ? STDOUT_FILENO : -1, 0, 0};
    ::ppoll(&output, 1, timeout, &mask);
    if ((output.revents & POLLNVAL) != 0) output_is_closed = true;
    if ((output.revents & (POLLERR | POLLHUP)) != 0) request_interrupt();
}

}  // namespace

void set_interrupt_handler(interrupt_handler handler) {
    registered_handler = handler;
    handler_has_run = false;
    accepting = true;
    set_signal_actions(receive_signal);
}

// A signal that may still be repeated keeps its action.
void restore_default_interrupt() {
    if (accepting.exchange(false) || !is_repeated()) set_signal_actions(SIG_DFL);
    simulated::serve_interrupt();
    registered_handler = nullptr;
}

bool interrupt_received() {
    return registered_handler != nullptr && (pending || handler_has_run);
}

void request_interrupt() {
    if (registered_handler != nullptr && !handler_has_run) pending = true;
}

namespace simulated {

void serve_interrupt() {
    if (serving || registered_handler == nullptr || !pending.exchange(false)) return;
    handler_has_run = true;
    serving = true;
    registered_handler();
    serving = false;
}

// The signals are blocked between the check and the wait, and ppoll unblocks them atomically, so
// that no interrupt is missed.
void await_interrupt(std::optional<nanoseconds> timeout) {
    sigset_t interrupt_mask{};
    sigset_t previous_mask{};
    ::sigemptyset(&interrupt_mask);
    for (const int signal : interrupt_signals)
        ::sigaddset(&interrupt_mask, signal);
    ::pthread_sigmask(SIG_BLOCK, &interrupt_mask, &previous_mask);
    if (!pending) {
        timespec remaining{};
        if (timeout) remaining = to_timespec(std::max(*timeout, nanoseconds(0)));
        wait_for_signal_or_lost_reader(timeout ? &remaining : nullptr, previous_mask);
    }
    ::pthread_sigmask(SIG_SETMASK, &previous_mask, nullptr);
}

}  // namespace simulated

}  // namespace platform
