#include "tests/replay/replay_host.h"

#include <cstdio>
#include <fstream>
#include <unistd.h>

#include "nrxctl/replay/replay_command.h"

namespace tests {

namespace {

struct temporary_file {
    temporary_file() = default;
    ~temporary_file() { std::remove(path.c_str()); }
    temporary_file(const temporary_file&) = delete;
    temporary_file& operator=(const temporary_file&) = delete;

    std::string path = testing::TempDir() + "samples-" + std::to_string(::getpid());
};

}  // namespace

std::string sample_file(std::string_view text) {
    static const temporary_file file;
    std::ofstream(file.path, std::ios::binary) << text;
    return file.path;
}

int run_replay(const lines& arguments) {
    const argument_vector command_line(arguments);
    int index = 1;
    nrx::replay_command(arguments[0], command_line.span(), index);
    return index - 1;
}

outcome replay(const lines& arguments, int* consumed) {
    int count = 0;
    outcome written = capture([&] { count = run_replay(arguments); });
    if (consumed != nullptr) *consumed = count;
    return written;
}

void expect_replay(const lines& arguments, const std::string& out, const std::string& reports) {
    const outcome written = replay(arguments);
    EXPECT_EQ(written.out, out) << testing::PrintToString(arguments);
    EXPECT_EQ(written.err, reports) << testing::PrintToString(arguments);
}

}  // namespace tests
