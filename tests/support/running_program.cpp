#include "tests/support/running_program.h"

#include <array>
#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>
#include <utility>

#include "tests/support/program.h"

namespace tests {

running_program::running_program(const std::string& path,
                                 const std::vector<std::string>& arguments) {
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0) return;
    const int err = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
    child_ = start_program(path, arguments, ends[1], err);
    ::close(ends[1]);
    ::close(err);
    output_ = ends[0];
}

running_program::~running_program() {
    if (child_ > 0) {
        ::kill(child_, SIGKILL);
        ::waitpid(child_, nullptr, 0);
    }
    ::close(output_);
}

bool running_program::read_more() {
    std::array<char, 65536> buffer;
    const ssize_t count = ::read(output_, buffer.data(), buffer.size());
    if (count > 0) out_.append(buffer.data(), static_cast<std::size_t>(count));
    return count > 0;
}

bool running_program::wait_for(const std::string& text, std::size_t position) {
    const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(10);
    while (out_.find(text, position) == std::string::npos) {
        const auto remaining = std::chrono::duration_cast<std::chrono::milliseconds>(
            deadline - std::chrono::steady_clock::now());
        pollfd readable{output_, POLLIN, 0};
        if (remaining.count() <= 0 ||
            ::poll(&readable, 1, static_cast<int>(remaining.count())) <= 0)
            return false;
        if (!read_more()) return false;
    }
    return true;
}

void running_program::send_signal(int signal) const {
    ::kill(child_, signal);
}

void running_program::stop_reading() {
    ::close(std::exchange(output_, -1));
}

int running_program::finish() {
    while (read_more()) {
    }
    const process_end end = tests::wait_for(child_);
    child_ = -1;
    processor_time_ = end.processor_time;
    return end.status;
}

}  // namespace tests
