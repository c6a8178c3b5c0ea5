#include "bench/process_times.h"

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

[[noreturn]] void give_up(const std::string& program) {
    std::fprintf(stderr, "%s does not run\n", program.c_str());
    std::exit(EXIT_FAILURE);
}

// The three standard streams of the program, all of them /dev/null.
class no_streams {
public:
    no_streams() {
        ::posix_spawn_file_actions_init(&actions_);
        for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
            ::posix_spawn_file_actions_addopen(&actions_, descriptor, "/dev/null", O_RDWR, 0);
        }
    }
    ~no_streams() { ::posix_spawn_file_actions_destroy(&actions_); }
    no_streams(const no_streams&) = delete;
    no_streams& operator=(const no_streams&) = delete;

    [[nodiscard]] const posix_spawn_file_actions_t* actions() const { return &actions_; }

private:
    posix_spawn_file_actions_t actions_{};
};

}  // namespace

process_cost run_once(const std::vector<std::string>& words) {
    static const no_streams streams;
    std::vector<char*> arguments;
    arguments.reserve(words.size() + 1);
    for (const std::string& word : words) {
        arguments.push_back(const_cast<char*>(word.c_str()));
    }
    arguments.push_back(nullptr);

    using clock = std::chrono::steady_clock;
    const auto begin = clock::now();
    pid_t child = 0;
    if (::posix_spawnp(&child, arguments[0], streams.actions(), nullptr, arguments.data(),
                       environ) != 0) {
        give_up(words[0]);
    }
    int status = 0;
    rusage used{};
    ::wait4(child, &status, 0, &used);
    const std::chrono::duration<double, std::micro> taken = clock::now() - begin;
    if (!WIFEXITED(status) || WEXITSTATUS(status) >= cannot_execute) give_up(words[0]);
    return {taken.count(), static_cast<double>(used.ru_maxrss) * 1024 / 1e6};
}

}  // namespace bench
