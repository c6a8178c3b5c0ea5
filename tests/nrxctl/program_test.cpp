// nrxctl as a process on the embedded device.
#include "tests/support/program.h"

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdio>
#include <ctime>
#include <fcntl.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

#include <gtest/gtest.h>

#include "tests/golden/golden_text.h"
#include "tests/support/argument_vector.h"
#include "tests/support/rows.h"
#include "tests/support/running_program.h"

namespace {

using namespace tests;

const std::string program = NRXCTL_PROGRAM;
const std::string version = "nrxctl " NRXCTL_VERSION "\nhost: virtual NRX, embedded\n";

// Runs the program on arguments with a space between them.
program_result run(const std::string& arguments, output_target target = output_target::pipe) {
    return run_program(program, split(arguments), target);
}

TEST(nrxctl_program, ends_with_the_status_of_its_options) {
    EXPECT_EQ(run("--version").status, 0);
    EXPECT_EQ(run("--report nobody 1 --version").status, 1);
    EXPECT_EQ(run("--version --foo").status, 2);
}

TEST(nrxctl_program, prints_fixed_output_whole) {
    for (std::string option : {"help", "list", "sensor accel 2", "sensor gyro 2",
                               "sensor compass 2", "sensor pressure 2", "sensor als 2"}) {
        const auto result = run("--" + option + " --version");
        EXPECT_EQ(result.status, 0) << option;
        EXPECT_EQ(result.err, "") << option;
        std::replace(option.begin(), option.end(), ' ', '_');
        EXPECT_EQ(result.out, golden_text("nrxctl_" + option + ".txt") + version);
    }
}

TEST(nrxctl_program, writes_generated_samples_in_blocks) {
    const auto writes = record_writes(program, split("--replay generate gyro sin 1 5"));
    ASSERT_EQ(writes.size(), 1U);
    EXPECT_EQ(split(writes[0], '\n').size(), 5U);
}

TEST(nrxctl_program, writes_one_line_at_a_time) {
    for (const std::string arguments : {"--sensor accel 2", "--sensor nobody 2", "--replay help",
                                        "--replay get-status", "--events 1"}) {
        const auto writes = record_writes(program, split(arguments));
        EXPECT_GE(writes.size(), 5U) << arguments;
        for (const std::string& text : writes) {
            // Some lines are followed by empty ones.
            const std::size_t end = text.find('\n');
            EXPECT_NE(end, std::string::npos) << text;
            EXPECT_EQ(text.find_first_not_of('\n', end), std::string::npos) << text;
        }
    }
}

TEST(nrxctl_program, measures_events_on_the_clocks_of_the_host) {
    const std::string out = run("--events 1").out;
    const std::size_t vendor_event = out.find("now: ");
    ASSERT_NE(vendor_event, std::string::npos);
    const double wall = std::stod(out.substr(out.find("wall: ", vendor_event) + 6));
    EXPECT_NEAR(wall, static_cast<double>(std::time(nullptr)), 10);
}

// A watch and what it prints first; the end of its output in order.
struct watch_row {
    std::string arguments;
    std::string awaited;
    std::string end;
};

const std::string id_line = "Found an id for service = 16\n";
const std::vector<watch_row> watches{
    {"--profile monitor", "(humanReadable=disabled)\n", "\ndone\n"},
    {"--profile auto sensor:accel:data", "prof-event 02020002", "\ndone\n"},
    {"--scm auto scm:smb0", "smb0.", "\ndone\n"},
    {"--spi-status 0x10 0xffffffff", id_line, id_line},
    {"--events --version", "ResetCallback ", "\n" + version},
};

TEST(nrxctl_program, waits_without_using_the_processor_and_ends_in_order) {
    std::size_t number = 0;
    for (const auto& [arguments, awaited, end] : watches) {
        running_program watch(program, split(arguments));
        ASSERT_TRUE(watch.wait_for(awaited)) << arguments;
        const int signal = std::array{SIGINT, SIGTERM, SIGHUP}.at(number++ % 3);
        watch.send_signal(signal);
        watch.send_signal(signal);  // as a program that signals a process and its group does
        EXPECT_EQ(watch.finish(), 0) << arguments;
        EXPECT_TRUE(watch.out().ends_with(end)) << arguments;
        EXPECT_LT(watch.processor_time(), 0.1) << arguments;
    }
    running_program ends_by_itself(program, split("--profile 300 sensor:accel:data"));
    EXPECT_EQ(ends_by_itself.finish(), 0);
    EXPECT_TRUE(ends_by_itself.out().ends_with("\ndone\n"));
    EXPECT_LT(ends_by_itself.processor_time(), 0.1);
}

// Also while it waits for something to print.
TEST(nrxctl_program, ends_a_watch_when_its_reader_goes_away) {
    for (const auto& [arguments, awaited, end] : watches) {
        running_program watch(program, split(arguments));
        ASSERT_TRUE(watch.wait_for(awaited)) << arguments;
        watch.stop_reading();
        EXPECT_EQ(watch.finish(), 0) << arguments;
        EXPECT_LT(watch.processor_time(), 0.1) << arguments;
    }
}

TEST(nrxctl_program, leaves_a_hang_up_ignored_that_it_was_started_to_ignore) {
    std::signal(SIGHUP, SIG_IGN);
    running_program watch(program, split("--events --version"));
    std::signal(SIGHUP, SIG_DFL);
    ASSERT_TRUE(watch.wait_for("ResetCallback "));
    watch.send_signal(SIGHUP);
    const std::size_t size = watch.out().size();
    EXPECT_TRUE(watch.wait_for("[accelerometer]", size));
    watch.send_signal(SIGINT);
    EXPECT_EQ(watch.finish(), 0);
}

TEST(nrxctl_program, is_ended_by_an_interrupt_after_a_watch) {
    // Nothing is ever written into this sample file: the option after the watch blocks in it.
    const std::string path = testing::TempDir() + "fifo-" + std::to_string(::getpid());
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    const int writer = ::open(path.c_str(), O_RDWR | O_CLOEXEC);
    running_program blocked(program, split("--events 0 --version --replay load " + path));
    ASSERT_TRUE(blocked.wait_for(version));
    blocked.send_signal(SIGINT);
    blocked.wait_for("more");  // returns when the program ends
    ::close(writer);
    EXPECT_EQ(blocked.finish(), 128 + SIGINT);
    std::remove(path.c_str());
}

// Generating four billion lines would take hours.
TEST(nrxctl_program, fails_if_output_is_lost_but_not_without_a_reader) {
    const std::string lost = "nrxctl: output was lost: ";
    for (const auto& [target, status, err] : rows<output_target, int, std::string>{
             {output_target::closed_pipe, 0, ""},
             {output_target::full_device, 1, lost + "No space left on device\n"},
             {output_target::closed, 1, lost + "Bad file descriptor\n"}}) {
        for (const char* arguments : {"--list", "--profile human 60 sensor:accel", "--events 1",
                                      "--replay generate accel sin 1 4294967295"}) {
            const auto result = run(arguments, target);
            EXPECT_EQ(result.status, status) << arguments;
            EXPECT_EQ(result.err, err) << arguments;
            EXPECT_LT(result.processor_time, 0.2) << arguments;
        }
    }
}

// Its reader does not read: the pipe is full.
TEST(nrxctl_program, ends_a_watch_that_is_blocked_in_a_write) {
    std::array<int, 2> ends{};
    ASSERT_EQ(::pipe2(ends.data(), O_CLOEXEC), 0);
    ::fcntl(ends[1], F_SETPIPE_SZ, 4096);
    const int err = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
    const pid_t watch =
        start_program(program, split("--profile human auto sensor:accel"), ends[1], err);
    ::close(err);
    // Another line of 400 characters and more does not fit.
    for (int size = 0; size < 4096 - 400; ::ioctl(ends[0], FIONREAD, &size))
        std::this_thread::yield();
    ::close(ends[1]);
    // As by a user who presses Ctrl-C again and again. The one that ends the write comes in time.
    siginfo_t end{};
    while (::waitid(P_PID, static_cast<id_t>(watch), &end, WEXITED | WNOHANG | WNOWAIT) == 0 &&
           end.si_pid == 0) {
        ::kill(watch, SIGINT);
        ::poll(nullptr, 0, 20);
    }
    EXPECT_EQ(wait_for(watch).status, 1);
    ::close(ends[0]);
}

// The run goes on to its end, and so do the options after it.
TEST(nrxctl_program, fails_beyond_the_limit_of_a_files_size) {
    const rlimit limit{.rlim_cur = 512, .rlim_max = RLIM_INFINITY};
    rlimit previous{};
    ::getrlimit(RLIMIT_FSIZE, &previous);
    ::setrlimit(RLIMIT_FSIZE, &limit);
    const auto result = run("--profile 200 sensor:accel:data --sensor nosuch", output_target::file);
    ::setrlimit(RLIMIT_FSIZE, &previous);
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.out.size(), 512U);
    EXPECT_EQ(result.err,
              "nrxctl: no service \"nosuch\"; --list shows all\n"
              "nrxctl: output was lost: File too large\n");
}

}  // namespace
