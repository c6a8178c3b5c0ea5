// The interrupt signal of the virtual host: the signal of the process itself.

#include <algorithm>
#include <atomic>
#include <csignal>
#include <ctime>
#include <poll.h>

#include "platform/interrupt.h"
#include "platform/virtual/interrupts.h"

namespace platform {

namespace {

std::atomic<bool> noted = false;
static_assert(std::atomic<bool>::is_always_lock_free);

interrupt_handler registered = nullptr;
bool serving = false;

extern "C" void note_interrupt(int /*signal*/) {
    noted = true;
}

void set_action(void (*action)(int)) {
    struct sigaction wanted {};
    wanted.sa_handler = action;
    wanted.sa_flags = SA_RESTART;
    ::sigaction(SIGINT, &wanted, nullptr);
}

timespec as_timespec(std::chrono::nanoseconds duration) {
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(duration);
    return {.tv_sec = seconds.count(), .tv_nsec = (duration - seconds).count()};
}

}  // namespace

void handle_interrupt(interrupt_handler handler) {
    registered = handler;
    set_action(note_interrupt);
}

void restore_default_interrupt() {
    set_action(SIG_DFL);
    simulated::serve_interrupt();
    registered = nullptr;
}

namespace simulated {

void serve_interrupt() {
    if (serving || registered == nullptr) return;
    serving = true;
    while (noted.exchange(false))
        registered();
    serving = false;
}

// The signal is held back while it is decided whether to block, and let in by ppoll together with
// the wait: none can slip in between.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout) {
    sigset_t held_back{};
    sigset_t usual{};
    ::sigemptyset(&held_back);
    ::sigaddset(&held_back, SIGINT);
    ::pthread_sigmask(SIG_BLOCK, &held_back, &usual);
    if (!noted) {
        timespec left{};
        if (timeout) left = as_timespec(std::max(*timeout, std::chrono::nanoseconds(0)));
        ::ppoll(nullptr, 0, timeout ? &left : nullptr, &usual);
    }
    ::pthread_sigmask(SIG_SETMASK, &usual, nullptr);
}

}  // namespace simulated

}  // namespace platform
