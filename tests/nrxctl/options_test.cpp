// The options of nrxctl in this process, on services of the embedded device with a manual clock.
#include "nrxctl/options/options.h"

#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <fstream>
#include <getopt.h>
#include <optional>
#include <unistd.h>

#include "nrxctl/base/clock_references.h"
#include "platform/clock.h"
#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist/parts.h"
#include "tests/golden/golden_text.h"
#include "tests/support/argument_vector.h"
#include "tests/support/device_test.h"
#include "tests/support/rows.h"

namespace tests {

class options : public device_test {
public:
    options() {
        using namespace platform::simulated;
        add_interface_services(host);
        add_hid_devices(host);
        add_profiler(host);
        add_replay(host);
        add_named_properties(host);
        add_mca(host);
        add_hid_events(host);
        host.clock().set_wall_start(std::chrono::seconds(1'000'000'000));
        host.set_boot_time({1'000'000'000, 0});
        add_time_sync(host, [] { return sync_point{0, 1'000'000'000'000'000'000}; });
        ::setenv("TZ", "UTC", 1);
        ::tzset();
        nrx::tick_period = platform::tick_period();
    }

protected:
    // Runs arguments with a space between them. The status is that of a return from main or of the
    // end of the process.
    static outcome run(const std::string& arguments) {
        argument_vector command_line(split("nrxctl " + arguments));
        optind = 1;
        std::optional<int> returned;
        auto result =
            capture([&] { returned = nrx::nrxctl::run(command_line.argc(), command_line.argv()); });
        if (!result.status) result.status = returned;
        return result;
    }

    interface_driver& service = add_service(host, "x", 0x70);
};

TEST_F(options, report_a_usage_error_with_status_2) {
    const std::string missing = "a word is missing after ";
    for (const auto& [arguments, message] : rows<std::string, std::string>{
             {"", "an option is needed"},
             {"--", "an option is needed"},
             {"--foo", "unknown option --foo"},
             {"-x", "unknown option -x"},
             {"--help=x", "unknown option --help=x"},
             {"list", "unknown word list"},
             {"--list more", "unknown word more"},
             {"--sensor accel 1 2", "unknown word 2"},
             {"--profile", missing + "--profile"},
             {"--version --sensor", missing + "--sensor"},
             {"--report accel", missing + "--report"},
             {"--report accel --list", missing + "--report"},
             {"--set-report accel", missing + "--set-report"},
             {"--set-report accel 1", missing + "--set-report"},
             {"--command accel", missing + "--command"},
             {"--get-property accel", missing + "--get-property"},
             {"--set-property accel", missing + "--set-property"},
             {"--set-property accel gain u8", missing + "--set-property"},
             {"--hid-driver --list", missing + "--hid-driver"},
             {"--spi-status accel", missing + "--spi-status"},
         }) {
        const auto result = run(arguments);
        EXPECT_EQ(result.status, 2) << message;
        EXPECT_EQ(result.err, "nrxctl: " + message + "\nTry nrxctl --help.\n");
    }
}

TEST_F(options, reject_an_argument_with_an_invalid_value_with_status_1) {
    for (const auto& [arguments, message] : rows<std::string, std::string>{
             {"--report accel d0", "report id is invalid (d0)\n"},
             {"--report accel 256", "report id is invalid (256)\n"},
             {"--set-report accel 0x100 1", "report id is invalid (0x100)\n"},
             {"--report accel 1 0x100001", "capacity is invalid (0x100001)\n"},
             {"--sensor accel 0x80000000", "level is invalid (0x80000000)\n"},
             {"--scalar accel 1 x", "scalar is invalid (x)\n"},
             {"--spi-status accel 4294967296", "mode is invalid (4294967296)\n"},
             {"--spi-status 2147483648 1", "service is invalid (2147483648)\n"},
             {"--spi-status 0x80000000 1", "service is invalid (0x80000000)\n"},
             {"--spi-status -2147483648 1", "service is invalid (-2147483648)\n"},
             {"--events 2147483648", "seconds are invalid (2147483648)\n"},
             {"--profile human sensor:accel", "duration parameter is invalid (sensor:accel)\n"},
             {"--mca On", "mca is neither on nor off (On)\n"},
             {"--command accel 0x100000000", "command code is invalid (0x100000000)\n"},
         }) {
        const auto result = run(arguments);
        EXPECT_EQ(result.out, message);
        EXPECT_EQ(result.status, 1) << arguments;
    }
}

TEST_F(options, accept_the_extreme_values_of_an_argument) {
    service.set_report(0, {1});
    service.set_report(0xff, byte_list(65'536));
    std::vector<std::uint64_t> scalars;
    service.set_scalar_method([&](std::span<const std::uint64_t> values) {
        scalars.assign(values.begin(), values.end());
        return platform::success;
    });
    const std::string line = "00000000: 01                                                | .\n";
    EXPECT_EQ(run("--report x 0 1").out, line);
    EXPECT_EQ(run("--report x 0 0x100000").out, line);
    EXPECT_EQ(run("--report x 0xff").status, 0);
    EXPECT_EQ(run("--report x 0xff 65535").status, 1);
    service.set_report(0xff, byte_list(65'537));
    EXPECT_EQ(run("--report x 0xff").status, 1);
    EXPECT_EQ(run("--report x 0xff 65537").status, 0);
    EXPECT_EQ(run("--scalar x 0").status, 0);
    EXPECT_EQ(scalars, std::vector<std::uint64_t>{0});
    EXPECT_EQ(run("--scalar x 9223372036854775807 1").status, 0);
    EXPECT_EQ(scalars, (std::vector<std::uint64_t>{9223372036854775807, 1}));
}

TEST_F(options, make_one_driver_call_each_and_fail_with_it) {
    const auto chain =
        run("--scalar accel 0x5 --get-property accel self-test --set-property 16 gain u16 1 0d10 "
            "--get-property accel gain --hid-driver u32 1 0 --mca on --get-property mca mode-60 "
            "--mca off --set-report profile 0xd5 u32 1 --report 0x50 0xd5 --command profile 0x21 "
            "--spi-status 17 0 --version");
    EXPECT_EQ(chain.status, 0);
    EXPECT_EQ(chain.err, "");
    EXPECT_EQ(chain.out,
              "00000000: 05 00 00 00                                       | ....\n"
              "00000000: 01 00 0a 00                                       | ....\n"
              "00000000: 01 00 00 00 00 00 00 00  07 00 00 00 00 00 00 00  | ........ ........\n"
              "Turning ON MCA\n"
              "00000000: 01 00 00 00                                       | ....\n"
              "Turning OFF MCA\n"
              "00000000: 01 00 00 00                                       | ....\n"
              "Found an id for service = 17\n"
              "nrxctl " NRXCTL_VERSION "\n");
    for (const auto& [arguments, out] : rows<std::string, std::string>{
             {"--report nobody 1", ""},
             {"--report profile 0xd5 3", ""},
             {"--set-report profile 0 1", ""},
             {"--command profile 0x7f 1 2",
              "command 0x7f is not supported for device\n"
              "payload 00000000: 01 02                                             | ..\n"},
             {"--scalar accel", ""},
             {"--scalar mux 1", ""},
             {"--get-property accel colour", ""},
             {"--set-property mux x 1", ""},
             {"--hid-driver 1", ""},
             {"--spi-status nobody 1", "service is invalid (nobody)\n"},
         }) {
        const auto result = run(arguments + " --version");
        EXPECT_EQ(result.status, 1) << arguments;
        EXPECT_NE(result.err, "") << arguments;
        EXPECT_EQ(result.out, out + "nrxctl " NRXCTL_VERSION "\n");
    }
}

TEST_F(options, give_a_family_the_arguments_before_the_next_long_option) {
    for (const char* arguments : {"--profile config bogus sensor:gyro", "--scm 10 bogus scm:smb0",
                                  "--profile get-logs bad errdump", "--profile monitor 1 human",
                                  "--replay get-status left over -x"}) {
        const auto result = run(std::string(arguments) + " --version");
        EXPECT_EQ(result.status, 0) << arguments;
        EXPECT_TRUE(result.out.ends_with("nrxctl " NRXCTL_VERSION "\n")) << arguments;
    }
    const std::string accel = "    profiler sensor     is enabled [component=accel, reports=4]\n";
    EXPECT_EQ(run("--profile config sensor:accel:data --profile get-config").out,
              accel + "No client is connected\n\nActive components in kext:\n" + accel +
                  "\nActive components in fw:\n" + accel);
}

TEST_F(options, print_what_arrives_in_a_time_or_before_an_interrupt) {
    using namespace std::chrono_literals;
    for (const auto& [arguments, interrupt_after, file] :
         rows<std::string, std::chrono::milliseconds, std::string>{
             {"--events 2", 0ms, "events"},
             {"--spi-status gyro 2", 610ms, "spi_status"},
             {"--profile human 100 sensor:accel,gyro:data exec:command:command:all", 0ms,
              "profile"},
             {"--scm 200 scm:smb0:ch4", 0ms, "scm"},
         }) {
        if (interrupt_after > 0ms)
            host.clock().run_at(host.clock().now() + interrupt_after, [] { std::raise(SIGINT); });
        const auto result = run(arguments);
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.err, "");
        EXPECT_EQ(result.out, golden_text("nrxctl_" + file + ".txt"));
    }
}

TEST_F(options, generate_samples_and_play_them_back) {
    const std::string path = testing::TempDir() + "walk-" + std::to_string(::getpid()) + ".txt";
    std::ofstream(path) << run("--replay generate accel sin 10000 1hz").out;
    const auto result = run("--replay load " + path +
                            " last sram left --replay schedule-enable 5 accel "
                            "--replay get-status");
    std::remove(path.c_str());
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(result.out,
              "accel: loaded 100 events\n"
              "Replay status:\n"
              "Service accel      is enabled\n"
              "Service gyro       is inactive\n"
              "Service compass    is inactive\n"
              "Service pressure   is inactive\n");
}

}  // namespace tests
