// What the options of nrxctl do once the command line is accepted.
#include "nrxctl/options/options.h"

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <fstream>
#include <new>
#include <unistd.h>

#include "platform/virtual/wrist/parts.h"
#include "tests/golden/golden_text.h"
#include "tests/nrxctl/options_host.h"
#include "tests/support/argument_vector.h"
#include "tests/support/rows.h"
#include "tests/support/terminal.h"

namespace tests {

using options = options_host;

const std::string version = "nrxctl " NRXCTL_VERSION "\nhost: virtual NRX\n";

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

TEST_F(options, run_in_order_and_print_their_replies) {
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
              "Found an id for service = 17\n" +
                  version);
}

// Every option after the failed one is still run.
TEST_F(options, fail_with_status_1_and_say_what_failed) {
    for (const auto& [arguments, out, reports, message] :
         rows<std::string, std::string, std::size_t, std::string>{
             {"--report nobody 1", "", 1, "no service \"nobody\"; --list shows all"},
             {"--report acel 1", "", 1,
              "no service \"acel\"; --list shows all (did you mean accel?)"},
             {"--report wqr-buton 0xd0", "", 1,
              "no service \"wqr-buton\"; --list shows all (did you mean wqr-button?)"},
             {"--report 0x99 1", "", 1, "no service \"0x99\"; --list shows all"},
             {"--report profile 0xd5 3", "", 1, ""},
             {"--set-report profile 0 1", "", 1, ""},
             {"--command profile 0x7f 1 2",
              "command 0x7f is not supported for device\n"
              "payload 00000000: 01 02                                             | ..\n",
              1, ""},
             {"--scalar accel", "", 1, ""},
             {"--scalar mux 1", "", 1, ""},
             {"--get-property accel colour", "", 1, ""},
             {"--set-property mux x 1", "", 1, ""},
             {"--hid-driver 1", "", 1, ""},
             {"--spi-status nobody 1", "", 1, "no service \"nobody\"; --list shows all"},
             {"--spi-status 0x80000000 1", "", 0, "no service \"0x80000000\"; --list shows all"},
             {"--spi-status arc 0", "Found an id for service = 50\n", 1,
              "\"arc\" has no HID device; --list shows all services"},
             {"--sensor mca", "sensor mca doesn't provide sensor info (kr=e00002c7)\n\n", 0, ""},
             {"--replay enable nobody", "", 2, "no service \"nobody\"; --list shows all"},
             {"--replay enable mux", "", 2, ""},
             {"--replay unload mux", "Service mux can't be unloaded\n", 0, ""},
             {"--replay unload 0x80000000", "Service 0x80000000 not found\n", 0,
              "no service \"0x80000000\"; --list shows all"},
         }) {
        const auto result = run(arguments + " --version");
        EXPECT_EQ(result.status, 1) << arguments;
        EXPECT_EQ(result.out, out + version);
        const lines messages = split(result.err, '\n');
        ASSERT_EQ(messages.size(), reports + (message.empty() ? 0 : 1)) << result.err;
        for (std::size_t i = 0; i < reports; ++i)
            EXPECT_TRUE(messages[i].starts_with("Assertion failed: nrxtoollib: ")) << result.err;
        if (message.empty()) continue;
        EXPECT_EQ(messages.back(), "nrxctl: " + message);
    }
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

static std::size_t count_of(const std::string& part, const std::string& text) {
    std::size_t count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1))
        ++count;
    return count;
}

TEST_F(options, end_each_watch_after_a_count_of_printed_events) {
    for (const auto& [arguments, event, end] : rows<std::string, std::string, std::string>{
             {"--events", "\n", "\n"},
             {"--spi-status gyro 2", "timestamp: ", "\nFound an id for service = 17\n"},
             {"--profile auto sensor:accel,gyro:data", "prof-event ", "\ndone\n"},
             {"--profile human auto sensor:accel,gyro:data", "{  'category'", "\ndone\n"},
             {"--profile config sensor:accel:data --profile enable --profile monitor",
              "prof-event ", "\ndone\n"},
             {"--scm auto scm:smb0:ch4", "smb0.4: ", "\ndone\n"},
         }) {
        for (const std::size_t count : {1U, 2U, 5U}) {
            const auto result = run("--count " + std::to_string(count) + " " + arguments);
            EXPECT_EQ(result.status, 0);
            EXPECT_EQ(result.err, "");
            EXPECT_EQ(count_of(event, result.out), count) << arguments;
            EXPECT_TRUE(result.out.ends_with(end)) << result.out;
        }
    }
    // Each watch counts for itself, until there is another count; stored records do not count.
    EXPECT_EQ(count_of("\n", run("--count 2 --events --events 1 --count 1 --events").out), 5U);
    EXPECT_GT(count_of("prof-event", run("--count 1 --events --profile get-logs").out), 1U);
    EXPECT_GT(count_of("\n", run("--events 1").out), 5U);
}

TEST_F(options, say_how_many_records_are_not_utf8) {
    auto& profile = platform::simulated::interface_of(host, "profile");
    byte_list record(48, 0xff);  // the function name is not UTF-8
    std::copy_n(byte_list{9, 0, 4, 0}.begin(), 4, record.begin());
    for (const auto& [records, message] :
         rows<std::size_t, std::string>{{1, "1 record was"}, {2, "2 records were"}}) {
        std::size_t reads = 0;
        const std::size_t record_count = records;
        profile.set_report_source(0xd1, [&](std::size_t, byte_list& reply) {
            for (std::size_t i = 0; reads == 0 && i < record_count; ++i)
                reply.insert(reply.end(), record.begin(), record.end());
            ++reads;
            return platform::success;
        });
        const auto result = run("--profile get-logs fwdump human");
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.err, "nrxctl: " + message + " not printed: the text is not UTF-8\n");
    }
}

TEST_F(options, print_a_report_the_same_by_name_and_by_id) {
    for (const auto& [by_name, by_id, beginning] : rows<std::string, std::string, std::string>{
             {"mux 0xd0", "0x20 0xd0", "data: 1 timestamp:"},
             {"wqr-button 0xd7", "64 0xd7", "kpdx_stats\n-- Last Button Press --\n"},
             {"WQR_wqr-button 0xd8", "0x40 0xd8", "Length: 1479, expected 1479\nASSET ["},
             {"arc 0xd0", "50 0xd0", "00000000: "},
         }) {
        const std::string out = run("--report " + by_name).out;
        EXPECT_TRUE(out.starts_with(beginning)) << out;
        EXPECT_EQ(run("--report " + by_id).out, out);
    }
}

TEST_F(options, show_a_reply_as_a_dump_or_as_bytes) {
    service.set_report(0xd0, {0x1b, 0, 0xff});
    service.set_named_property("p", {1, 2});
    service.set_command(7, [](platform::byte_view payload, byte_list& reply) {
        reply.assign(payload.begin(), payload.end());
        return platform::success;
    });
    const std::string requests = "--report 0x70 0xd0 --get-property x p --command x 7 41 0d10";
    EXPECT_EQ(run("--raw " + requests).out, std::string("\x1b\0\xff\1\2A\n", 7));
    EXPECT_EQ(run("--hex " + requests).out,
              "00000000: 1b 00 ff                                          | ...\n"
              "00000000: 01 02                                             | ..\n"
              "00000000: 41 0a                                             | A.\n");
    // Settings may be mixed; the later one of a kind holds.
    const auto mixed =
        run("--raw --count 9 --hex --get-property x p --count 1 --events --events 0");
    EXPECT_EQ(mixed.status, 0);
    EXPECT_TRUE(mixed.out.starts_with("00000000: 01 02 ")) << mixed.out;
    EXPECT_EQ(count_of("\n", mixed.out), 2U);
    // A message must not get between the bytes.
    const auto refused = run("--raw --command x 8 --get-property accel colour");
    EXPECT_EQ(refused.out, "");
    EXPECT_TRUE(refused.err.starts_with("command 0x8 is not supported for device\n"));
    const std::string button = run("--hex --report wqr-button 0xd7").out;
    EXPECT_TRUE(button.starts_with("00000000: ")) << button;
}

TEST_F(options, echo_what_they_write_and_name_the_host_on_a_terminal) {
    const terminal screen(STDERR_FILENO);
    const auto echoed = [&](const std::string& arguments) { return run(arguments).err; };
    const std::string host_line = "nrxctl: host: virtual NRX\n";
    EXPECT_EQ(echoed("--version --list"), host_line);
    EXPECT_EQ(echoed("--foo"), "nrxctl: unknown option --foo\nTry nrxctl --help.\n");
    service.set_report(10, {});
    EXPECT_EQ(echoed("--set-report x 10 10"),
              host_line +
                  "nrxctl: writing 1 byte to report 0x0a of x:\n"
                  "00000000: 10                                                | .\n");
    EXPECT_EQ(echoed("--set-property accel gain u16 1 0d10"),
              host_line +
                  "nrxctl: writing 4 bytes to property gain of accel:\n"
                  "00000000: 01 00 0a 00                                       | ....\n");
    EXPECT_EQ(echoed("--hid-driver u32 1 0").substr(0, host_line.size() + 42),
              host_line + "nrxctl: writing 8 bytes to the HID driver:");
    EXPECT_EQ(echoed("--command profile 0x21"), host_line);
}

TEST_F(options, do_not_write_bytes_to_a_terminal) {
    const terminal screen(STDOUT_FILENO);
    const auto result = run("--raw --report arc 0xd0");
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.err,
              "nrxctl: --raw writes bytes, which are not for a terminal; redirect the output\n"
              "Try nrxctl --help.\n");
    EXPECT_EQ(host.calls_made(), 0U);
}

TEST_F(options, end_with_one_line_when_memory_runs_out) {
    service.set_scalar_method(
        [](std::span<const std::uint64_t>) -> platform::return_code { throw std::bad_alloc(); });
    const auto result = run("--version --scalar x 1 --version");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.err, "nrxctl: out of memory\n");
    EXPECT_EQ(result.out, version);
}

TEST_F(options, name_the_line_of_a_sample_file_that_is_refused) {
    const std::string path = testing::TempDir() + "samples-" + std::to_string(::getpid());
    const std::string valid = "accel,x=1,y=2,z=3,sampleid=0,timestamp=5,temperature=2880";
    const std::string no_number =
        " is not a number; expected decimal digits, or 0x and hexadecimal ones";
    const std::string expand = " is compressed; expand it with ";
    const std::string no_samples = " contains no samples; expected lines SERVICE,KEY=VALUE,...";
    // A value that is refused ends the run; anything else, the option.
    for (const auto& [text, message, ends_run] : rows<std::string, std::string, bool>{
             {valid + "\n# c\n\n" + valid + ",x=1z\n", ":4: \"1z\"" + no_number, true},
             {valid + "\r\n", ":1: \"2880\\x0d\"" + no_number, true},
             {valid + "\n" + valid + "\ngyro,x=1,sampleid=1,temperature=1", ":3: y is missing",
              true},
             {"pressure,sampleid=1,temperature=1,p=2", ":1: timestamp is missing", true},
             {valid + ",shake=1", ":1: a shake cannot be played back; remove the line", true},
             {valid + "\n" + valid + "\n" + valid + "\naccel,x",
              ":4: a field is not KEY=VALUE; expected SERVICE,KEY=VALUE,...", false},
             {"", no_samples, false},
             {"# only\nfoo,x=1\n", no_samples, false},
             {"\x1f\x8b\x08,\n" + valid, expand + "gunzip", false},
             {"BZh9", expand + "bunzip2", false},
             {std::string("\xfd\x37zXZ\0", 6), expand + "unxz", false},
             {"\x28\xb5\x2f\xfd", expand + "unzstd", false},
             {"PK\3\4\n" + valid, expand + "unzip", false},
             {valid + std::string("\n\0", 2), " is not text", false},
         }) {
        std::ofstream(path) << text;
        const auto result = run("--replay load " + path + " --version");
        EXPECT_EQ(result.status, 1) << message;
        EXPECT_TRUE(result.err.ends_with("nrxctl: " + path + message + "\n")) << result.err;
        EXPECT_EQ(result.out.ends_with(version), !ends_run);
        EXPECT_EQ(result.out.find("loaded"), std::string::npos);
    }
    std::remove(path.c_str());
    const std::string no_file = " cannot be read: No such file or directory\n";
    EXPECT_TRUE(run("--replay load " + path).err.ends_with("nrxctl: " + path + no_file));
    EXPECT_TRUE(run("--replay load /").err.ends_with("nrxctl: / cannot be read: Is a directory\n"));
}

TEST_F(options, generate_samples_and_play_them_back) {
    const std::string path = testing::TempDir() + "walk-" + std::to_string(::getpid()) + ".txt";
    std::ofstream(path) << run("--replay generate accel sin 10000 1hz").out;
    const auto result = run("--replay load " + path +
                            " last sram --replay schedule-enable 5 accel "
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
