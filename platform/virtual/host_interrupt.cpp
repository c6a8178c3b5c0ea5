// The interrupt signal of the virtual host: the signal of the process itself.

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdint>
#include <ctime>
#include <poll.h>
#include <sys/eventfd.h>
#include <unistd.h>

#include "platform/interrupt.h"
#include "platform/virtual/interrupts.h"

namespace platform {

namespace {

std::atomic<bool> noted = false;
static_assert(std::atomic<bool>::is_always_lock_free);

interrupt_handler registered = nullptr;
bool serving = false;

// Readable once an interrupt was noted. Made at the first use and kept: a signal handler may be
// writing to it at any time.
int wake_descriptor = -1;

// The note comes before the wake: whoever was woken finds it.
extern "C" void note_interrupt(int /*signal*/) {
    const int saved_errno = errno;
    noted = true;
    const std::uint64_t one = 1;
    [[maybe_unused]] const ssize_t written = ::write(wake_descriptor, &one, sizeof(one));
    errno = saved_errno;
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
    if (wake_descriptor < 0) wake_descriptor = ::eventfd(0, EFD_NONBLOCK | EFD_CLOEXEC);
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

// An interrupt that comes in before ppoll begins has made the descriptor readable: none is missed.
void await_interrupt(std::optional<std::chrono::nanoseconds> timeout) {
    pollfd woken{.fd = wake_descriptor, .events = POLLIN, .revents = 0};
    timespec left{};
    if (timeout) left = as_timespec(std::max(*timeout, std::chrono::nanoseconds(0)));
    if (::ppoll(&woken, 1, timeout ? &left : nullptr, nullptr) <= 0) return;
    std::uint64_t count = 0;
    [[maybe_unused]] const ssize_t got = ::read(wake_descriptor, &count, sizeof(count));
}

}  // namespace simulated

}  // namespace platform
