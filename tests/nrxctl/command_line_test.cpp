// Command lines that nrxctl does not run: each is refused before any call of the platform.
#include "tests/nrxctl/options_host.h"
#include "tests/support/argument_vector.h"
#include "tests/support/rows.h"

namespace tests {

using command_line = options_host;

TEST_F(command_line, that_is_wrong_ends_with_status_2) {
    const std::string expected_u32 = " is out of range; expected a number from 0 to 4294967295";
    const std::string wanted_before =
        " must come before --report, --command, --get-property or "
        "--hid-driver";
    const std::string watches =
        "--count must come before --events, --scm, --spi-status or a run "
        "or monitor of "
        "--profile";
    for (const auto& [arguments, message] : rows<std::string, std::string>{
             // options
             {"", "an option is needed"},
             {"--", "unknown option --"},
             {"--foo", "unknown option --foo"},
             {"--evnts", "unknown option --evnts (did you mean --events?)"},
             {"--sensors", "unknown option --sensors (did you mean --sensor?)"},
             {"-x", "unknown option -x"},
             {"-list", "unknown option -list (did you mean --list?)"},
             {"list", "expected an option, not \"list\""},
             {"--rep", "--rep is ambiguous: --replay --report"},
             {"--h", "--h is ambiguous: --hid-driver --hex --help"},
             {"--list --profile 200 sensor:accel:data --bogus", "unknown option --bogus"},
             // too few arguments
             {"--profile", "--profile needs SUBCOMMAND [ARGUMENT...]"},
             {"--sensor --list", "--sensor needs NAME [LEVEL]"},
             {"--report accel", "--report needs SERVICE ID [CAPACITY]"},
             {"--set-report accel 1", "--set-report needs SERVICE ID [u8|u16|u32] VALUE..."},
             {"--set-report accel 1 u8", "a value is missing"},
             {"--command accel", "--command needs SERVICE CODE [u8|u16|u32] [VALUE...]"},
             {"--get-property accel", "--get-property needs SERVICE NAME"},
             {"--set-property accel gain u8", "a value is missing"},
             {"--hid-driver --list", "--hid-driver needs [u8|u16|u32] VALUE..."},
             {"--hid-driver u32", "a value is missing"},
             {"--command arc 1 u8", "a value is missing"},
             {"--mca", "--mca needs on|off"},
             {"--spi-status accel", "--spi-status needs SERVICE MODE"},
             {"--count", "--count needs N"},
             // too many
             {"--list more", "unexpected argument \"more\" after --list"},
             {"--list -x", "unexpected argument \"-x\" after --list"},
             {"--help=x", "unexpected argument \"x\" after --help"},
             {"--version --sensor accel 1 2", "unexpected argument \"2\" after --sensor"},
             {"--report accel 1 2 3", "unexpected argument \"3\" after --report"},
             {"--get-property accel p q", "unexpected argument \"q\" after --get-property"},
             {"--mca on extra", "unexpected argument \"extra\" after --mca"},
             {"--spi-status accel 1 2", "unexpected argument \"2\" after --spi-status"},
             {"--events 1 2", "unexpected argument \"2\" after --events"},
             {"--profile enable now", "unexpected argument \"now\" after enable"},
             {"--profile get-config x", "unexpected argument \"x\" after get-config"},
             {"--profile on-error panic now", "unexpected argument \"now\" after on-error"},
             {"--profile monitor 1 human", "unexpected argument \"human\" after monitor"},
             {"--profile monitor human 1 2", "unexpected argument \"2\" after monitor"},
             {"--replay get-status left", "unexpected argument \"left\" after get-status"},
             {"--replay load f last dram x", "unexpected argument \"x\" after load"},
             {"--replay load f filter last dram x", "unexpected argument \"x\" after load"},
             {"--replay generate accel sin 1 3 4", "unexpected argument \"4\" after generate"},
             // values
             {"--report accel d0", "\"d0\" is not a report id; expected a number from 0 to 255"},
             {"--report arc -1", "\"-1\" is not a report id; expected a number from 0 to 255"},
             {"--report accel 256", "\"256\" is not a report id; expected a number from 0 to 255"},
             {"--set-report accel 0x100 1",
              "\"0x100\" is not a report id; expected a number from 0 to 255"},
             {"--set-report arc 0xd0 1 -5", "\"-5\" is not a value; values cannot be negative"},
             {"--report accel 1 0x100001",
              "\"0x100001\" is not a capacity; expected a number from 1 to 1048576"},
             {"--report accel 1 0", "\"0\" is not a capacity; expected a number from 1 to 1048576"},
             {"--command accel 0x100000000",
              "\"0x100000000\" is not a command code; expected a number from 0 to 4294967295"},
             {"--sensor accel 0x80000000",
              "\"0x80000000\" is not a level; expected a number from 0 to 2147483647"},
             {"--scalar arc 5 -1",
              "\"-1\" is not a scalar; expected a number from 0 to 9223372036854775807"},
             {"--scalar accel 1 x",
              "\"x\" is not a scalar; expected a number from 0 to 9223372036854775807"},
             {"--spi-status accel 4294967296",
              "\"4294967296\" is not a mode; expected a number from 0 to 4294967295"},
             {"--events 2147483648",
              "\"2147483648\" is not a number of seconds; expected a number from 0 to 2147483647"},
             {"--mca On", "\"On\" is not a state; expected on or off"},
             {"--profile config", "config needs CONFIG..., such as sensor:accel"},
             {"--replay generate accel sin 100 -3", "\"-3\"" + expected_u32},
             {"--replay generate accel sin -1 3", "\"-1\"" + expected_u32},
             {"--replay generate accel sin 4294967297 1hz", "\"4294967297\"" + expected_u32},
             {"--replay generate accel sin 100 -1hz", "\"-1\"" + expected_u32},
             {"--replay generate accel sin 65537 65536hz",
              "a period contains no sample; expected a shorter interval or a lower frequency"},
             {"--replay schedule-enable -5 accel", "\"-5\"" + expected_u32},
             // settings
             {"--count 0 --events", "\"0\" is not a count; expected a number from 1 to 4294967295"},
             {"--count x --events", "\"x\" is not a count; expected a number from 1 to 4294967295"},
             {"--events --count 5", watches},
             {"--count 5 --profile get-logs", watches},
             {"--hex --list", "--hex" + wanted_before},
             {"--raw --count 2 --events", "--raw" + wanted_before},
         }) {
        const auto result = run(arguments);
        EXPECT_EQ(result.status, 2) << arguments;
        EXPECT_EQ(result.out, "") << arguments;
        EXPECT_EQ(result.err, "nrxctl: " + message + "\nTry nrxctl --help.\n");
        EXPECT_EQ(host.calls_made(), 0U) << arguments;
    }
}

TEST_F(command_line, that_the_library_refuses_ends_with_status_1) {
    const std::string no_duration =
        " is not a duration; expected auto, or milliseconds from 0 to 4294967";
    const std::string sensor_has =
        "; sensor has: accel gyro compass pressure gostin als temperature";
    for (const auto& [arguments, out, reports, message] :
         rows<std::string, std::string, std::size_t, std::string>{
             {"--set-report arc 1 zz", "payload value is invalid (zz)\n", 0,
              "\"zz\" is not a value; expected hexadecimal digits up to 7fffffff, or 0d and "
              "decimal "
              "ones"},
             {"--command arc 1 100", "Value 256 (0100) is bigger than allowed (255, 0xff)\n", 0,
              "\"100\" does not fit the width of the values; u8, u16 or u32 before the first one "
              "sets "
              "it"},
             {"--profile config sensor:acel:data", "", 4,
              "unknown component \"acel\" in \"sensor:acel:data\"" + sensor_has +
                  " (did you mean accel?)"},
             {"--profile config sensor:gyro trace:foo", "component is invalid (foo)\n", 0,
              "unknown component \"foo\" in \"trace:foo\"; trace takes a number or: remoteq "
              "endpoint "
              "systick interrupt mbi"},
             {"--profile config sensr:accel", "", 3,
              "unknown profiler \"sensr\" in \"sensr:accel\"; expected: exec trace sensor orrin "
              "talvor interrupt uart scm wake (did you mean sensor?)"},
             {"--profile config wake:wake:wake-stats", "report mask is invalid (wake-stats)\n", 0,
              "unknown report \"wake-stats\" in \"wake:wake:wake-stats\"; expected a mask or: all "
              "wake-req-stats wake-req-info wake-event-info (did you mean wake-req-stats?)"},
             {"--profile config exec:thread,command", "", 3,
              "not one component in \"exec:thread,command\"; exec takes one for each argument"},
             {"--profile set-config sensor", "", 2,
              "wrong number of fields in \"sensor\"; expected "
              "PROFILER:COMPONENTS[:REPORTS[:SERVICES]]"},
             {"--profile config trace:mbi:all:a,b,c,d,e,f,g,h,i", "", 3,
              "too many services in \"trace:mbi:all:a,b,c,d,e,f,g,h,i\"; expected at most 8"},
             {"--profile on-error foo", "invalid argument: foo\n", 0,
              "unknown action \"foo\"; expected: panic nothing"},
             {"--profile on-error", "invalid argument: \n", 0, "on-error needs panic|nothing"},
             {"--profile get-logs fwdmp", "Invalid parameter\n", 1,
              "unknown argument \"fwdmp\"; expected: errdump fwdump human (did you mean fwdump?)"},
             {"--profile monitor 5s", "duration parameter is invalid (5s)\n", 0,
              "\"5s\"" + no_duration},
             {"--profile human sensor:accel", "duration parameter is invalid (sensor:accel)\n", 0,
              "\"sensor:accel\"" + no_duration},
             {"--profile 4294968 sensor:accel", "duration parameter is invalid (4294968)\n", 0,
              "\"4294968\"" + no_duration},
             {"--profile enabel", "duration parameter is invalid (enabel)\n", 0,
              "unknown subcommand \"enabel\"; expected a duration or: help clear-eventsources "
              "eventsources get-eventsources wqrfw-wakestats enable disable stop flush config "
              "set-config get-config monitor signal-errdump get-logs on-error (did you mean "
              "enable?)"},
             {"--profile 100 sensor:acel",
              "duration=100000 us mode=enable (humanReadable=disabled)\n", 4,
              "unknown component \"acel\" in \"sensor:acel\"" + sensor_has +
                  " (did you mean accel?)"},
             {"--profile auto human sensor:accel",
              "duration=0 us mode=auto (humanReadable=disabled)\n", 2,
              "human must come before the duration"},
             {"--scm 300", "", 1, "--scm needs CONFIG..., such as scm:smb0"},
             {"--scm x scm:spi0", "duration parameter is invalid (x)\n", 0, "\"x\"" + no_duration},
             {"--scm 1 scm:spi9", "component is invalid (spi9)\n", 0,
              "unknown component \"spi9\" in \"scm:spi9\"; scm takes a number or: spi0 smb0 smb1 "
              "i2cm0 i2c_ctrl0 i2c_ctrl1 (did you mean spi0?)"},
             {"--replay load", "", 1, "load needs FILE"},
             {"--replay load f lats", "Invalid completion: lats\n", 0,
              "unknown completion \"lats\"; expected: default periodic stop last (did you mean "
              "last?)"},
             {"--replay load f filter last ram", "Invalid location: ram\n", 0,
              "unknown location \"ram\"; expected: dram sram local (did you mean dram?)"},
             {"--replay unload", "", 1, "unload needs SERVICE..."},
             {"--replay enable", "", 1, "enable, disable and schedule-enable need SERVICE..."},
             {"--replay schedule-enable", "", 1, "schedule-enable needs SECONDS SERVICE..."},
             {"--replay schedule-enable x accel", "invalid delay (x)\n", 0,
              "\"x\" is not a number; expected decimal digits, or 0x and hexadecimal ones"},
             {"--replay generate accel sin 1", "", 1,
              "generate needs SERVICE SIGNAL INTERVAL COUNT|FREQUENCYhz"},
             {"--replay generate foo sin 1 3", "invalid service foo\n", 0,
              "unknown generator \"foo\"; expected: accel gyro compass"},
             {"--replay generate accel sine 1 3", "invalid generator sine\n", 0,
              "unknown signal \"sine\"; expected: random delta step sin (did you mean sin?)"},
             {"--replay generate pressure sin 1 3", "invalid generator sin\n", 0,
              "unknown generator \"pressure\"; expected: accel gyro compass"},
             {"--replay generate accel sin 1 0hz", "", 1,
              "the frequency is 0; expected at least 1hz"},
             {"--replay generate accel sin 1000000 2hz", "", 1,
              "a period contains no sample; expected a shorter interval or a lower frequency"},
         }) {
        const auto result = run("--list " + arguments + " --list");
        EXPECT_EQ(result.status, 1) << arguments;
        EXPECT_EQ(result.out, out) << arguments;
        const lines messages = split(result.err, '\n');
        ASSERT_EQ(messages.size(), reports + 1) << result.err;
        for (std::size_t i = 0; i < reports; ++i)
            EXPECT_TRUE(messages[i].starts_with("Assertion failed: nrxtoollib: ")) << result.err;
        EXPECT_EQ(messages.back(), "nrxctl: " + message);
        EXPECT_EQ(host.calls_made(), 0U) << arguments;
    }
    const auto result = run("--replay frob");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(result.out.starts_with("Invalid subcommand frob\n\nusage:\n")) << result.out;
    EXPECT_EQ(result.err,
              "nrxctl: unknown subcommand \"frob\"; expected: help load unload schedule-enable "
              "enable disable get-status generate\n");
}

TEST_F(command_line, that_is_accepted_makes_its_calls) {
    service.set_report(1, {1});
    for (const auto& [arguments, calls] : rows<std::string, std::size_t>{
             {"--vers --lis --replay help --profile help", 0},
             {"--report x 1 --report=x 0x1 9", 2},
             {"--scalar accel 1 --scalar accel 0x2", 2},
             {"--set-report profile 0xd5 u32 0d1", 1},
             {"--profile on-error nothing --profile clear-eventsources", 2},
             {"--profile config sensor:accel,gyro:data trace:mbi:7", 2},
             {"--replay get-status --replay generate gyro sin 0xffffffff 3", 2},
             {"--mca off", 5},
         }) {
        const std::size_t before = driver_calls();
        const auto result = run(arguments);
        EXPECT_EQ(result.status, 0) << arguments;
        EXPECT_EQ(result.err, "") << arguments;
        EXPECT_EQ(driver_calls() - before, calls) << arguments;
    }
}

}  // namespace tests
