#include "tests/support/program.h"

#include <array>
#include <fcntl.h>
#include <future>
#include <sys/mman.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include "tests/support/argument_vector.h"

namespace tests {

namespace {

struct pipe_ends {
    int read_end = -1;
    int write_end = -1;
};

pipe_ends make_pipe(int flags = 0) {
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), flags | O_CLOEXEC) != 0) return {};
    return {ends[0], ends[1]};
}

// Reads a pipe to its end. Each read is one item.
std::vector<std::string> read_pieces(int descriptor) {
    std::vector<std::string> pieces;
    std::array<char, 65536> buffer;
    ssize_t count = 0;
    while ((count = ::read(descriptor, buffer.data(), buffer.size())) > 0) {
        pieces.emplace_back(buffer.data(), static_cast<std::size_t>(count));
    }
    ::close(descriptor);
    return pieces;
}

std::string joined(const std::vector<std::string>& pieces) {
    std::string text;
    for (const std::string& piece : pieces)
        text += piece;
    return text;
}

// Opens what the program writes to, and the end to read from if there is one.
pipe_ends open_target(output_target target) {
    switch (target) {
        case output_target::pipe:
            return make_pipe();
        case output_target::file: {
            const int file = ::memfd_create("output", MFD_CLOEXEC);
            return {file, file};
        }
        case output_target::closed_pipe: {
            const pipe_ends ends = make_pipe();
            ::close(ends.read_end);
            return {-1, ends.write_end};
        }
        case output_target::full_device:
            return {-1, ::open("/dev/full", O_WRONLY | O_CLOEXEC)};
        case output_target::closed:
            return {};
    }
    return {};
}

}  // namespace

process_end wait_for(pid_t child) {
    int status = 0;
    rusage usage{};
    ::wait4(child, &status, 0, &usage);
    const auto seconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
    };
    return {WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status),
            seconds(usage.ru_utime) + seconds(usage.ru_stime)};
}

pid_t start_program(const std::string& path, const std::vector<std::string>& arguments, int out,
                    int err) {
    std::vector<std::string> command{path};
    command.insert(command.end(), arguments.begin(), arguments.end());
    argument_vector command_line(std::move(command));
    const pid_t child = ::fork();
    if (child != 0) return child;
    if (out >= 0) {
        ::dup2(out, STDOUT_FILENO);
    } else {
        ::close(STDOUT_FILENO);
    }
    ::dup2(err, STDERR_FILENO);
    ::execv(path.c_str(), command_line.argv());
    ::_exit(127);
}

program_result run_program(const std::string& path, const std::vector<std::string>& arguments,
                           output_target target) {
    const pipe_ends out = open_target(target);
    const pipe_ends err = make_pipe();
    const pid_t child = start_program(path, arguments, out.write_end, err.write_end);
    const bool is_file = target == output_target::file;
    if (out.write_end >= 0 && !is_file) ::close(out.write_end);
    ::close(err.write_end);
    auto errors = std::async(std::launch::async, [&] { return joined(read_pieces(err.read_end)); });
    if (is_file) {
        errors.wait();  // until the program ends
        ::lseek(out.read_end, 0, SEEK_SET);
    }
    std::string text;
    if (out.read_end >= 0) text = joined(read_pieces(out.read_end));
    const std::string error_text = errors.get();
    const process_end end = wait_for(child);
    return {end.status, text, error_text, end.processor_time};
}

std::vector<std::string> record_writes(const std::string& path,
                                       const std::vector<std::string>& arguments) {
    const pipe_ends out = make_pipe(O_DIRECT);
    const int err = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
    const pid_t child = start_program(path, arguments, out.write_end, err);
    ::close(out.write_end);
    ::close(err);
    auto pieces = read_pieces(out.read_end);
    wait_for(child);
    return pieces;
}

}  // namespace tests
