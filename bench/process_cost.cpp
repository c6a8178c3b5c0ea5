#include "bench/process_cost.h"

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <spawn.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace bench {

namespace {

constexpr int cannot_execute = 126;

[[noreturn]] void exit_with_error(const std::string& program) {
    std::fprintf(stderr, "cannot run %s\n", program.c_str());
    std::exit(EXIT_FAILURE);
}

// Spawn actions that open /dev/null as the three standard streams.
class null_streams {
public:
    null_streams() {
        ::posix_spawn_file_actions_init(&actions_);
        for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
            ::posix_spawn_file_actions_addopen(&actions_, descriptor, "/dev/null", O_RDWR, 0);
        }
    }
    ~null_streams() { ::posix_spawn_file_actions_destroy(&actions_); }
    null_streams(const null_streams&) = delete;
    null_streams& operator=(const null_streams&) = delete;

    [[nodiscard]] const posix_spawn_file_actions_t* actions() const { return &actions_; }

private:
    posix_spawn_file_actions_t actions_{};
};

}  // namespace

process_cost measure_process(const std::vector<std::string>& arguments) {
    static const null_streams streams;
    std::vector<char*> pointers;
    pointers.reserve(arguments.size() + 1);
    for (const std::string& argument : arguments) {
        pointers.push_back(const_cast<char*>(argument.c_str()));
    }
    pointers.push_back(nullptr);

    using clock = std::chrono::steady_clock;
    const auto begin = clock::now();
    pid_t child = 0;
    if (::posix_spawnp(&child, pointers[0], streams.actions(), nullptr, pointers.data(), environ) !=
        0) {
        exit_with_error(arguments[0]);
    }
    int status = 0;
    rusage usage{};
    ::wait4(child, &status, 0, &usage);
    const std::chrono::duration<double, std::micro> elapsed = clock::now() - begin;
    if (!WIFEXITED(status) || WEXITSTATUS(status) >= cannot_execute) exit_with_error(arguments[0]);
    return {elapsed.count(), static_cast<double>(usage.ru_maxrss) * 1024 / 1e6};
}

}  // namespace bench
