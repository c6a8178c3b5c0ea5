// nrxctl as a process on the embedded device.
#include "tests/support/program.h"

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <ctime>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include "tests/golden/golden_text.h"
#include "tests/support/argument_vector.h"
#include "tests/support/rows.h"
#include "tests/support/running_program.h"

namespace {

using namespace tests;

const std::string program = NRXCTL_PROGRAM;
const std::string version = "nrxctl " NRXCTL_VERSION "\n";

// Runs the program on arguments with a space between them.
program_result run(const std::string& arguments, output_target target = output_target::pipe) {
    return run_program(program, split(arguments), target);
}

TEST(nrxctl_program, ends_with_the_status_of_its_options) {
    EXPECT_EQ(run("--version").status, 0);
    EXPECT_EQ(run("--report nobody 1 --version").status, 1);
    EXPECT_EQ(run("--mca On").status, 1);
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

TEST(nrxctl_program, waits_without_using_the_processor_and_ends_in_order) {
    const std::string id_line = "Found an id for service = 16\n";
    for (const auto& [arguments, awaited, end] : rows<std::string, std::string, std::string>{
             {"--profile 300 sensor:accel:data", "", "\ndone\n"},  // ends by itself
             {"--profile monitor", "(humanReadable=disabled)\n", "\ndone\n"},
             {"--profile auto sensor:accel:data", "prof-event 02020002", "\ndone\n"},
             {"--spi-status 0x10 0xffffffff", id_line, id_line},
             {"--events --version", "ResetCallback ", "\n" + version},
         }) {
        running_program watch(program, split(arguments));
        if (!awaited.empty()) {
            ASSERT_TRUE(watch.wait_for(awaited)) << arguments;
            watch.send_interrupt();
        }
        EXPECT_EQ(watch.finish(), 0) << arguments;
        EXPECT_TRUE(watch.out().ends_with(end)) << arguments;
        EXPECT_LT(watch.processor_time(), 0.1) << arguments;
    }
}

TEST(nrxctl_program, is_ended_by_an_interrupt_after_a_watch) {
    // Nothing is ever written into this sample file: the option after the watch blocks in it.
    const std::string path = testing::TempDir() + "fifo-" + std::to_string(::getpid());
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    const int writer = ::open(path.c_str(), O_RDWR | O_CLOEXEC);
    running_program blocked(program, split("--events 0 --version --replay load " + path));
    ASSERT_TRUE(blocked.wait_for(version));
    blocked.send_interrupt();
    blocked.wait_for("more");  // returns when the program ends
    ::close(writer);
    EXPECT_EQ(blocked.finish(), 128 + SIGINT);
    std::remove(path.c_str());
}

// Generating four billion lines would take hours.
TEST(nrxctl_program, continues_without_a_reader_unless_it_only_generates) {
    for (const auto target :
         {output_target::closed_pipe, output_target::full_device, output_target::closed}) {
        for (const char* arguments :
             {"--profile human 60 sensor:accel", "--replay generate accel sin 1 -1"}) {
            const auto result = run(arguments, target);
            EXPECT_EQ(result.status, 0) << arguments;
            EXPECT_EQ(result.err, "") << arguments;
        }
    }
}

}  // namespace
