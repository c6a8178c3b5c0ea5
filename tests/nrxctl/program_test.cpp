// nrxctl as a process, on the embedded device.
#include "tests/support/program.h"

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <ctime>
#include <fcntl.h>
#include <fstream>
#include <sys/stat.h>
#include <thread>
#include <unistd.h>

#include <gtest/gtest.h>

#include "tests/support/rows.h"
#include "tests/support/running_program.h"
#include "tests/support/word_vector.h"

namespace {

using namespace tests;
using namespace std::chrono_literals;

const std::string program = NRXCTL_PROGRAM;

// Runs the program with words that have a blank between them.
program_result run(const std::string& words, output_to target = output_to::pipe) {
    return run_program(program, split(words), target);
}

TEST(nrxctl_program, misuse_is_named_on_standard_error_with_status_2) {
    const rows<std::string, std::string> cases{
        {"", "an option is needed"},
        {"--foo", "unknown option --foo"},
        {"-x", "unknown option -x"},
        {"list", "unknown word list"},
        {"--list more", "unknown word more"},
        {"--profile", "a word is missing after --profile"},
        {"--replay", "a word is missing after --replay"},
        {"--sensor", "a word is missing after --sensor"},
        {"--sensor accel 1 2", "unknown word 2"},
        {"--report accel", "a word is missing after --report"},
        {"--report accel --list", "a word is missing after --report"},
        {"--set-report accel 1", "a word is missing after --set-report"},
        {"--command accel", "a word is missing after --command"},
        {"--get-property accel", "a word is missing after --get-property"},
        {"--set-property accel", "a word is missing after --set-property"},
        {"--set-property accel gain u8", "a word is missing after --set-property"},
        {"--hid-driver --list", "a word is missing after --hid-driver"},
        {"--spi-status accel", "a word is missing after --spi-status"},
        {"--help=x", "unknown option --help=x"},
    };
    for (const auto& [arguments, problem] : cases) {
        const auto result = run(arguments);
        EXPECT_EQ(result.status, 2) << problem;
        EXPECT_EQ(result.err, "nrxctl: " + problem + "\nTry nrxctl --help.\n");
    }
}

TEST(nrxctl_program, numbers_that_are_none_or_out_of_range_end_it_with_status_1) {
    for (const auto& [words, message] : rows<std::string, std::string>{
             {"--report accel d0", "report id is invalid (d0)\n"},
             {"--report accel 256", "report id is invalid (256)\n"},
             {"--sensor accel two", "level is invalid (two)\n"},
             {"--sensor accel 0x80000000", "level is invalid (0x80000000)\n"},
             {"--report accel 1 0x100001", "capacity is invalid (0x100001)\n"},
             {"--scalar accel 1 x", "scalar is invalid (x)\n"},
             {"--spi-status accel 4294967296", "mode is invalid (4294967296)\n"},
             {"--spi-status 2147483648 1", "service is invalid (2147483648)\n"},
             {"--events 2147483648", "seconds are invalid (2147483648)\n"},
             {"--profile human sensor:accel", "duration parameter is invalid (sensor:accel)\n"},
             {"--events 1.5", "seconds are invalid (1.5)\n"},
             {"--mca On", "mca is neither on nor off (On)\n"},
             {"--command accel 0x100000000", "command code is invalid (0x100000000)\n"},
         }) {
        const auto result = run(words);
        EXPECT_EQ(result.out, message);
        EXPECT_EQ(result.status, 1) << words;
    }
}

TEST(nrxctl_program, help_and_version_are_on_standard_output) {
    const auto help = run("--help");
    EXPECT_EQ(help.status, 0);
    EXPECT_TRUE(help.out.starts_with("usage: nrxctl OPTION...\n  --profile SUBCOMMAND [WORD...] "));
    EXPECT_EQ(run("--version").out, "nrxctl " NRXCTL_VERSION "\n");
}

TEST(nrxctl_program, lists_every_interface_service_with_its_id) {
    const auto lines = split(run("--list").out, '\n');
    EXPECT_GT(lines.size(), 10U);
    EXPECT_EQ(std::count(lines.begin(), lines.end(), "WQR_wqr-button           0x40"), 1);
    EXPECT_EQ(std::count(lines.begin(), lines.end(), "profile                  0x50"), 1);
}

TEST(nrxctl_program, shows_a_sensor_at_level_1_unless_told_otherwise) {
    const auto summary = run("--sensor gyro");
    EXPECT_EQ(summary.status, 0);
    EXPECT_EQ(summary.err, "");
    EXPECT_TRUE(summary.out.starts_with("Sensor type : gyro\nDevice      : "));
    EXPECT_TRUE(summary.out.ends_with("\nSupportedRanges: 250 500 1000 2000 \n\n\n"));
    const auto detailed = run("--sensor gyro 2 --version");
    EXPECT_EQ(detailed.err, "");
    EXPECT_TRUE(
        detailed.out.starts_with(summary.out.substr(0, summary.out.size() - 2) + "Clients "));
    EXPECT_TRUE(detailed.out.ends_with("]\n\n\nnrxctl " NRXCTL_VERSION "\n"));
    const auto unknown = run("--sensor nobody");
    EXPECT_EQ(unknown.status, 0);
    EXPECT_NE(unknown.out.find("\nAvailable HID services: accel gyro "), std::string::npos);
}

TEST(nrxctl_program, writes_one_line_at_a_time) {
    for (const std::string words : {"--sensor accel 2", "--sensor nobody 2", "--replay help",
                                    "--replay get-status", "--replay generate gyro sin 1 5"}) {
        const auto writes = writes_of(program, split(words));
        EXPECT_GE(writes.size(), 5U) << words;
        for (const std::string& text : writes) {
            // Some lines are followed by empty ones.
            const std::size_t end = text.find('\n');
            EXPECT_NE(end, std::string::npos) << text;
            EXPECT_EQ(text.find_first_not_of('\n', end), std::string::npos) << text;
        }
    }
}

TEST(nrxctl_program, reads_writes_and_commands_and_tells_by_its_status_whether_all_went_well) {
    EXPECT_EQ(run("--report wqr-button 0xd7").status, 0);
    const auto chain =
        run("--set-report profile 0xd5 u32 1 --report 0x50 0xd5 --command profile 0x21");
    EXPECT_EQ(chain.status, 0);
    EXPECT_EQ(chain.out, "00000000: 01 00 00 00                                       | ....\n");
    const auto failing = run("--report nobody 1 --version");
    EXPECT_EQ(failing.status, 1);
    EXPECT_NE(failing.err.find("Check failed: service bail"), std::string::npos);
    EXPECT_EQ(failing.out, "nrxctl " NRXCTL_VERSION "\n");
    EXPECT_EQ(run("--command profile 0x7f 1 2").out,
              "command 0x7f is not supported for device\n"
              "payload 00000000: 01 02                                             | ..\n");
    EXPECT_EQ(run("--command profile 0x7f").status, 1);
    EXPECT_EQ(run("--report profile 0xd5 3").status, 1);
}

TEST(nrxctl_program, families_have_the_words_before_the_next_option) {
    for (const char* words : {"--profile config bogus sensor:gyro", "--scm 10 bogus scm:smb0",
                              "--profile get-logs bad errdump", "--profile monitor 1 human"}) {
        const auto result = run(std::string(words) + " --version");
        EXPECT_EQ(result.status, 0) << words;
        EXPECT_EQ(result.err.find("unknown word"), std::string::npos) << words;
        EXPECT_TRUE(result.out.ends_with("nrxctl " NRXCTL_VERSION "\n")) << words;
    }
    const std::string accel = "    profiler sensor     is enabled [component=accel, reports=4]\n";
    EXPECT_EQ(run("--profile config sensor:accel:data --profile get-config").out,
              accel + "No client is connected\n\nActive components in kext:\n" + accel +
                  "\nActive components in fw:\n" + accel);
}

TEST(nrxctl_program, profiles_for_a_time_and_ends_by_itself) {
    const auto started = std::chrono::steady_clock::now();
    const auto whole = run("--profile human 300 sensor:accel,gyro:data exec:command:command:all");
    EXPECT_GE(std::chrono::steady_clock::now() - started, 400ms);
    EXPECT_EQ(whole.status, 0);
    EXPECT_EQ(whole.err, "");
    const auto lines = split(whole.out, '\n');
    ASSERT_GE(lines.size(), 12U);
    EXPECT_EQ(lines.front(), "duration=300000 us mode=enable (humanReadable=enabled)");
    EXPECT_EQ(lines.back(), "done");
    const auto holding = [&](const std::string& text) {
        return std::count_if(lines.begin(), lines.end(), [&](const std::string& line) {
            return line.find(text) != std::string::npos;
        });
    };
    // At least: on a busy machine more events fall between enabling and the start of the duration.
    EXPECT_GE(holding("'component': 'accel', 'event':      'data'"), 5);
    EXPECT_GE(holding("'component':  'gyro', 'event':      'data'"), 5);
    EXPECT_GE(holding("'component':'command'"), 5);
    EXPECT_GE(holding("'category':'control'"), 3);
}

TEST(nrxctl_program, prints_the_transfers_of_a_bus) {
    const auto result = run("--scm 200 scm:smb0:ch4");
    EXPECT_EQ(result.err, "");
    const auto lines = split(result.out, '\n');
    ASSERT_GT(lines.size(), 4U);
    EXPECT_TRUE(lines[0].starts_with("smb0.4: scm_read wqr_timestamp="));
    EXPECT_TRUE(lines[1].starts_with("smb0.4:   data[0-"));
    EXPECT_EQ(lines.back(), "done");
}

TEST(nrxctl_program, what_waits_takes_no_processor_time_and_ends_at_once_when_interrupted) {
    for (const auto& [words, begins, ends, grace] :
         rows<std::string, std::string, std::string, std::chrono::milliseconds>{
             {"--profile monitor", "humanReadable=disabled)\n", "\ndone\n", 90ms},
             {"--events --version", "[accelerometer] ", "\nnrxctl " NRXCTL_VERSION "\n", 0ms},
         }) {
        running_program waiter(program, split(words));
        ASSERT_TRUE(waiter.wait_for(begins));
        std::this_thread::sleep_for(500ms);
        const auto interrupted = std::chrono::steady_clock::now();
        waiter.send_interrupt();
        EXPECT_EQ(waiter.finish(), 0);
        const auto took = std::chrono::steady_clock::now() - interrupted;
        EXPECT_GE(took, grace);
        EXPECT_LT(took, 2s);
        EXPECT_TRUE(waiter.out().ends_with(ends));
        EXPECT_LT(waiter.processor_time(), 0.1);
    }
}

TEST(nrxctl_program, interrupted_as_soon_as_it_begins_it_ends_all_the_same) {
    const std::string found = "Found an id for service = 16\n";
    for (const auto& [words, begins, ends] : rows<std::string, std::string, std::string>{
             {"--profile human auto wake:all", "humanReadable=enabled)\n", "done\n"},
             {"--spi-status 0x10 0xffffffff", found, found},
         }) {
        for (int round = 0; round < 10; ++round) {
            running_program begun(program, split(words));
            ASSERT_TRUE(begun.wait_for(begins));
            std::this_thread::sleep_for(round * 200us);
            begun.send_interrupt();
            EXPECT_EQ(begun.finish(), 0);
            EXPECT_TRUE(begun.out().ends_with(ends));
        }
    }
}

TEST(nrxctl_program, interrupted_in_a_stream_twice_and_in_the_grace_it_ends_once) {
    running_program monitor(program, split("--profile auto sensor:accel:data"));
    ASSERT_TRUE(monitor.wait_for("prof-event 02020002"));
    monitor.send_interrupt();
    monitor.send_interrupt();
    std::this_thread::sleep_for(50ms);
    monitor.send_interrupt();
    EXPECT_EQ(monitor.finish(), 0);
    EXPECT_TRUE(monitor.out().ends_with("\ndone\n"));
}

TEST(nrxctl_program, calls_drivers_beside_their_reports_and_tells_how_it_went) {
    const auto chain =
        run("--scalar accel 0x5 --get-property accel self-test --set-property 16 gain u16 1 0d10 "
            "--get-property accel gain --hid-driver u32 1 0 --mca on --get-property mca mode-60 "
            "--mca off");
    EXPECT_EQ(chain.status, 0);
    EXPECT_EQ(chain.err, "");
    EXPECT_EQ(chain.out,
              "00000000: 05 00 00 00                                       | ....\n"
              "00000000: 01 00 0a 00                                       | ....\n"
              "00000000: 01 00 00 00 00 00 00 00  07 00 00 00 00 00 00 00  | ........ ........\n"
              "Turning ON MCA\n"
              "00000000: 01 00 00 00                                       | ....\n"
              "Turning OFF MCA\n");
    for (const char* failing :
         {"--scalar accel", "--scalar mux 1", "--hid-driver 1", "--get-property accel colour",
          "--set-property mux x 1", "--spi-status nobody 1"}) {
        EXPECT_EQ(run(failing).status, 1) << failing;
    }
}

TEST(nrxctl_program, prints_hid_events_for_a_time_a_whole_line_per_write) {
    const auto started = std::chrono::steady_clock::now();
    const auto lines = writes_of(program, split("--events 2"));
    EXPECT_GE(std::chrono::steady_clock::now() - started, 2s);
    const auto beginning = [&](const std::string& text) {
        return std::count_if(lines.begin(), lines.end(),
                             [&](const std::string& line) { return line.starts_with(text); });
    };
    for (const std::string& line : lines)
        EXPECT_EQ(line.find('\n'), line.size() - 1) << line;
    // One more may fall between the start of the events and that of the loop.
    const auto one_of = [&](const std::string& text, std::ptrdiff_t count) {
        return beginning(text) == count || beginning(text) == count + 1;
    };
    EXPECT_TRUE(one_of("[null] ", 2)) << beginning("[null] ");
    EXPECT_TRUE(one_of("[accelerometer] ", 10)) << beginning("[accelerometer] ");
    EXPECT_EQ(beginning("now: "), 4);
    EXPECT_EQ(beginning("type: 2latency: "), 1);
    EXPECT_EQ(beginning("TALY_CALLBACK: "), 3);
    EXPECT_EQ(beginning("ResetCallback 0x"), 1);
    // The first vendor-defined event, on the wall clock.
    const auto vendor = std::find_if(lines.begin(), lines.end(), [](const std::string& line) {
        return line.starts_with("now: ");
    });
    ASSERT_NE(vendor, lines.end());
    const double wall = std::stod(vendor->substr(vendor->find("wall: ") + 6));
    EXPECT_NEAR(wall, static_cast<double>(std::time(nullptr)), 10);
}

TEST(nrxctl_program, spi_status_is_switched_off_again_when_interrupted) {
    const std::string found = "Found an id for service = 17\n";
    running_program watch(program, split("--spi-status gyro 2"));
    ASSERT_TRUE(watch.wait_for("STATUS: errorCode(0x7001)"));
    watch.send_interrupt();
    EXPECT_EQ(watch.finish(), 0);
    EXPECT_TRUE(watch.out().starts_with(found + "\ntimestamp: "));
    EXPECT_TRUE(watch.out().ends_with("\n" + found));
    EXPECT_EQ(run("--spi-status 17 0").out, found);
}

TEST(nrxctl_program, interrupted_after_a_watch_it_ends_as_ever) {
    // Nothing is ever written into this sample file: the option behind the watch blocks in it.
    const std::string path = testing::TempDir() + "fifo-" + std::to_string(::getpid());
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    for (const std::string watch : {"--events 0", "--spi-status accel 0"}) {
        const int writer = ::open(path.c_str(), O_RDWR | O_CLOEXEC);
        running_program blocked(program, split(watch + " --version --replay load " + path));
        ASSERT_TRUE(blocked.wait_for("nrxctl " NRXCTL_VERSION "\n"));
        blocked.send_interrupt();
        blocked.wait_for("more");  // until its end, or until it has had time enough
        ::close(writer);
        EXPECT_EQ(blocked.finish(), 128 + SIGINT) << watch;
    }
    std::remove(path.c_str());
}

TEST(nrxctl_program, generates_samples_and_plays_them_back) {
    const auto generated = run("--replay generate accel sin 10000 1hz");
    EXPECT_EQ(generated.status, 0);
    EXPECT_EQ(split(generated.out, '\n').size(), 100U);
    const std::string path = testing::TempDir() + "walk-" + std::to_string(::getpid()) + ".txt";
    std::ofstream(path) << generated.out;
    // Words that a subcommand leaves aside do not reach the next option.
    const auto loaded = run("--replay load " + path +
                            " last sram left --replay schedule-enable 5 accel "
                            "--replay get-status --replay load " +
                            path);
    EXPECT_EQ(loaded.status, 0);
    EXPECT_EQ(loaded.err, "");
    EXPECT_EQ(loaded.out,
              "accel: loaded 100 events\n"
              "Replay status:\n"
              "Service accel      is enabled\n"
              "Service gyro       is inactive\n"
              "Service compass    is inactive\n"
              "Service pressure   is inactive\n"
              "Service accel had already samples; you have to unload first\n");
    std::ofstream(path) << "accel,shake=1,sampleid=1,temperature=2,x=3,y=4,z=5,timestamp=6\n";
    const auto refused = run("--replay load " + path + " --replay get-status");
    EXPECT_EQ(refused.status, 1);
    EXPECT_EQ(refused.out, "Shake samples are not allowed\n");
    std::remove(path.c_str());
}

// Four billion lines would take hours.
TEST(nrxctl_program, output_that_nobody_reads_ends_nothing_but_what_does_nothing_else) {
    for (const auto target : {output_to::closed_pipe, output_to::full_device, output_to::nowhere}) {
        for (const char* words :
             {"--profile human 60 sensor:accel", "--replay generate accel sin 1 -1"}) {
            const auto result = run(words, target);
            EXPECT_EQ(result.status, 0) << words;
            EXPECT_EQ(result.err, "") << words;
        }
    }
}

}  // namespace
