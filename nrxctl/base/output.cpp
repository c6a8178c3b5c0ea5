#include "nrxctl/base/output.h"

#include <cerrno>
#include <csignal>
#include <cstddef>
#include <poll.h>
#include <string>
#include <unistd.h>

namespace nrx {

namespace {

// Whether a failed write is worth another try: after a signal, or once a full pipe has room again.
bool may_try_again(int descriptor) {
    if (errno == EINTR) return true;
    if (errno != EAGAIN) return false;
    pollfd waiting{descriptor, POLLOUT, 0};
    return ::poll(&waiting, 1, -1) > 0 || errno == EINTR;
}

// Whether all was written.
bool write_all(int descriptor, std::string_view text) {
    while (!text.empty()) {
        const ssize_t written = ::write(descriptor, text.data(), text.size());
        if (written > 0) {
            text.remove_prefix(static_cast<std::size_t>(written));
        } else if (written == 0 || !may_try_again(descriptor)) {
            return false;
        }
    }
    return true;
}

}  // namespace

bool write_output(std::string_view text) {
    return write_all(STDOUT_FILENO, text);
}

void print_line(std::string_view text) {
    std::string line;
    line.reserve(text.size() + 1);
    line.append(text).push_back('\n');
    write_output(line);
}

void write_error(std::string_view text) {
    write_all(STDERR_FILENO, text);
}

void survive_closed_pipes() {
    std::signal(SIGPIPE, SIG_IGN);
}

}  // namespace nrx
