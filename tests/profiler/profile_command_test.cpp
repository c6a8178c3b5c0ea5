#include "nrxctl/profiler/profile_command.h"

#include <csignal>

#include "nrxctl/decoders/record_text.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

namespace {

constexpr const char* state_file = "profiler/state_subcommands.cpp";
constexpr const char* statistics_file = "profiler/statistics_subcommands.cpp";
constexpr const char* log_file = "profiler/log_subcommands.cpp";
constexpr const char* run_file = "profiler/monitor_subcommands.cpp";

// The calls of one operation on a half of the profiler.
lines exchange(const std::string& name, const std::string& call) {
    return {"open " + name + " type 0", "call " + name + " " + call, "close " + name};
}

byte_list event_source(std::string name, std::uint64_t first) {
    name.resize(36);
    return joined(
        {byte_list(name.begin(), name.end()),
         words_of({first, first + 1, first + 2, first + 3, first + 4, first + 5, first + 6})});
}

}  // namespace

class profile_command : public profiler_test {
protected:
    // Runs a subcommand that writes this on standard output and these failure reports.
    void says(const std::string& words, const std::string& out, const std::string& reports = "") {
        const outcome written = profile(words);
        EXPECT_EQ(written.out, out) << words;
        EXPECT_EQ(written.err, reports) << words;
    }
};

TEST_F(profile_command, help_prints_the_usage) {
    EXPECT_EQ(profile("help ignored").out,
              "usage:\n"
              "    nrxctl --profile enable\n"
              "    nrxctl --profile disable\n"
              "    nrxctl --profile flush\n"
              "    nrxctl --profile config <profiler>:<component> ...\n"
              "    nrxctl --profile get-config\n"
              "    nrxctl --profile signal-errdump\n"
              "    nrxctl --profile get-logs [fwdump] [errdump]\n"
              "    nrxctl --profile monitor [human] [auto | <duration>]\n"
              "    nrxctl --profile eventsources\n"
              "    nrxctl --profile wqrfw-wakestats\n");
    EXPECT_TRUE(host.log().empty());
}

TEST_F(profile_command, simple_requests_are_one_call_each_and_say_nothing) {
    put_both_halves();
    for (const auto& [words, name, call] : rows<std::string, std::string, std::string>{
             {"enable", driver_name, "0 scalars [0x1] in [] results 0 room 0"},
             {"disable", driver_name, "0 scalars [0x0] in [] results 0 room 0"},
             {"signal-errdump", driver_name, "10 scalars [] in [] results 0 room 0"},
             {"stop", "profile", "3 scalars [0x21] in [] results 0 room 0"},
             {"flush", "profile", "3 scalars [0x23] in [] results 0 room 0"},
             {"clear-eventsources", "profile",
              "3 scalars [0x20] in [00 00 00 00 00 00 00 00] results 0 room 0"},
             {"on-error panic", "profile", "1 scalars [0xd5] in [01 00 00 00] results 0 room 0"},
             {"on-error nothing", "profile", "1 scalars [0xd5] in [00 00 00 00] results 0 room 0"},
         }) {
        says(words, "");
        EXPECT_EQ(happened(), exchange(name, call)) << words;
    }
}

TEST_F(profile_command, requests_to_missing_halves_are_reported_or_not_made) {
    const std::string no_driver = failed(conn_file, "service");
    const std::string no_profile = failed(channel_file, "service");
    const std::string no_statistics =
        no_profile + failed(statistics_file, "kr == 0 ", not_found_text);
    const rows<std::string, std::string> cases{
        {"enable", no_driver + failed(kernel_file, "success")},
        {"disable", no_driver + failed(kernel_file, "success")},
        {"signal-errdump", ""},
        {"stop", ""},
        {"flush", ""},
        {"clear-eventsources", no_statistics},
        {"eventsources", no_statistics},
        {"wqrfw-wakestats", no_statistics},
        {"on-error panic", no_profile + failed(log_file, "kr == 0 ", not_found_text)},
        {"get-config", no_driver + failed(state_file, "success")},
    };
    for (const auto& [words, reports] : cases)
        says(words, "", reports);
}

TEST_F(profile_command, refused_requests_are_reported_by_each_who_checks) {
    put_both_halves();
    answer(0x21, platform::simulated::io_failure);
    answer(0x23, platform::simulated::io_failure);
    service->drop_report(0xd5);
    driver->answers[0] = driver->answers[10] = {{.code = platform::unsupported}};
    EXPECT_EQ(profile("stop").err, failed(command_file, "kr == 0 ", io_text));
    EXPECT_EQ(profile("flush").err,
              failed(command_file, "kr == 0 ", io_text) + failed(state_file, "kr == 0 ", io_text));
    EXPECT_EQ(profile("on-error nothing").err, failed(command_file, "kr == 0 ", unsupported_text) +
                                                   failed(log_file, "kr == 0 ", unsupported_text));
    for (const char* word : {"enable", "signal-errdump"})
        EXPECT_EQ(profile(word).err, failed(kernel_file, "kr == 0 ", unsupported_text));
}

TEST_F(profile_command, event_sources_are_a_table_of_whole_rows) {
    put_both_halves();
    const std::string header =
        "thread           eventsource function   context    count      total_time max_time   "
        "max_latency\n";
    const std::string idle =
        "idle                      9          a          b         12         13         14"
        "         15\n";
    answer(0x20, platform::success,
           joined({event_source("a_thread_of_20_chars", 0xfffffff0), event_source("idle", 9),
                   byte_list(36, 'x')}));
    EXPECT_EQ(profile("eventsources").out,
              header +
                  "a_thread_of_20_c   fffffff0   fffffff1   fffffff2 4294967283 4294967284 "
                  "4294967285 4294967286\n" +
                  idle);
    EXPECT_EQ(happened(), exchange("profile",
                                   "3 scalars [0x20] in [00 00 00 00 01 00 00 00] "
                                   "results 0 room 12800"));
    answer(0x20, platform::success, event_source("idle", 9));
    EXPECT_EQ(profile("get-eventsources").out, header + idle);
    answer(0x20, platform::success, byte_list(63, 'x'));
    EXPECT_EQ(profile("get-eventsources").out, header);
}

TEST_F(profile_command, wake_requests_are_a_table_of_27_names) {
    put_both_halves();
    const std::string header = "wake_reason      wake_req_count \n";
    byte_list counts = words_of({0xffffffff, 16});
    counts.resize(108);
    answer(0x20, platform::success, counts);
    std::string all = header + "nrx_none           ffffffff \nnrx                      10 \n";
    for (const char* name :
         {"nrx_queue_overfl", "nrx_ferrin      ", "nrx_corvane     ", "nrx_activity_ala",
          "nrx_sedintary_al", "nrx_gesture     ", "nrx_touch       ", "voice_trigger   ",
          "nrx_velm_reset  ", "audio           ", "nrx_aggregate_di", "nrx_als         ",
          "nrx_reset_slave ", "nrx_SCMHIDDebug ", "nrx_READY       ", "nrx_rtp_hr      ",
          "nrx_rtp_tamo    ", "nrx_kpdx        ", "nrx_zarn_reset  ", "wqr_flapcase    ",
          "nrx_slave       ", "nrx_rtp_ctrl    ", "wqr_ttw         ", "wqr_pellix_unplu",
          "nrx_unknown     "}) {
        all += std::string(name) + "          0 \n";
    }
    says("wqrfw-wakestats", all);
    EXPECT_EQ(happened(), exchange("profile",
                                   "3 scalars [0x20] in [0a 00 00 00 00 00 00 00] "
                                   "results 0 room 108"));
    counts.resize(7);
    answer(0x20, platform::success, counts);
    says("wqrfw-wakestats", header + "nrx_none           ffffffff \n");
}

TEST_F(profile_command, config_prints_and_applies_what_the_words_say_or_nothing) {
    put_both_halves();
    says("config sensor:accel sensor:7", "",
         failed(grammar_file, "enable_num_components") + failed(grammar_file, "result") +
             failed(grammar_file, "result") + failed(state_file, "success"));
    EXPECT_EQ(profile("config scm:x").out, "component is invalid (x)\n");
    EXPECT_TRUE(happened().empty());
    EXPECT_EQ(profile("config sensor:accel:data exec:packet").out,
              "    profiler sensor     is enabled [component=accel, reports=4]\n"
              "    profiler exec       is enabled [component=command, reports=ffffffff services= "
              "all]\n");
    EXPECT_EQ(logged("call").size(), 2U);
    EXPECT_EQ(profile("set-config").err, "");
    EXPECT_EQ(logged("call").size(), 4U);
    driver->answers[2] = {{.code = platform::no_memory}};
    EXPECT_EQ(profile("config").err,
              failed(apply_file, "result == 0 ", no_memory_text) + failed(state_file, "success"));
}

TEST_F(profile_command, get_config_shows_both_halves) {
    put_both_halves();
    const byte_list record = joined({words_of({2, 1, 0, 4}), byte_list(36, 0)});
    driver->answers[1] = {{.scalar = 0x100000000}, {.scalar = 0}};
    driver->answers[3] = {{.bytes = joined({record, record, {1, 2}})},
                          {.code = platform::unsupported},
                          {.bytes = byte_list(51, 0)}};
    service->set_report(0xd0, record);
    const std::string gyro = "    profiler sensor     is enabled [component=gyro, reports=4]\n";
    EXPECT_EQ(profile("get-config").out, "A client is connected\n\nActive components in kext:\n" +
                                             gyro + gyro + "\nActive components in fw:\n" + gyro);
    EXPECT_EQ(
        logged("call"),
        (lines{status_call, "call KeltoNRXProfileDriver 3 scalars [] in [] results 0 room 1040",
               "call profile 2 scalars [0xd0] in [] results 0 room 1040"}));
    service->drop_report(0xd0);
    const std::string none =
        "No client is connected\n\nActive components in kext:\n    none\n\nActive components in "
        "fw:\n    ";
    says("get-config", none + "none\n");
    service->set_report(0xd0, byte_list(51, 1));
    EXPECT_EQ(profile("get-config").out, none + "none\n");
    host.remove("profile");
    EXPECT_EQ(profile("get-config").out, none + "fw profiler is not available\n");
}

TEST_F(profile_command, get_logs_prints_the_logs_that_the_words_name) {
    const std::string firmware = dumped(3, 1) + dumped(3, 2) + "\n\n";
    const std::string errors = "errdump\n" + dumped(3, 5) + "\n\n";
    const rows<std::string, std::string> cases{
        {"get-logs", firmware},
        {"get-logs fwdump", firmware},
        {"get-logs errdump", errors},
        {"get-logs errdump fwdump", firmware + errors},
    };
    put_both_halves();
    for (const auto& [words, out] : cases) {
        driver->answers[9] = {{.bytes = record_bytes(3, 2)}, {}};
        driver->answers[8] = {{.bytes = record_bytes(3, 5)}, {}};
        service->set_report_source(0xd1, [read = false](std::size_t, byte_list& reply) mutable {
            if (!std::exchange(read, true)) reply = record_bytes(3, 1);
            return platform::success;
        });
        says(words, out);
    }
    driver->answers[9] = {{.bytes = record_bytes(0, 0)}, {}};
    EXPECT_TRUE(profile("get-logs human").out.starts_with("{  'category':  'exec',"));
    happened();
    says("get-logs fwdump Human errdump", "Invalid parameter\n", failed(log_file, "false"));
    EXPECT_TRUE(happened().empty());
}

TEST_F(profile_command, subcommands_take_their_own_words_and_no_other) {
    put_both_halves();
    driver->queue->add(record_bytes(0, 0));
    const rows<std::string, int> cases{
        {"help x", 0},
        {"enable x", 0},
        {"on-error panic x", 1},
        {"on-error Panic x", 1},
        {"monitor auto human", 1},
        {"get-logs fwdump bad errdump", 2},
        {"config sensor:accel bad sensor:gyro", 2},
        {"config sensor:accel sensor:gyro", 2},
    };
    for (const auto& [words, its_own] : cases) {
        profile(words);
        EXPECT_EQ(taken, its_own) << words;
    }
    happened();
    EXPECT_EQ(profile("on-error Panic").out, "invalid argument: Panic\n");
    EXPECT_EQ(profile("on-error").out, "invalid argument: \n");
    EXPECT_TRUE(happened().empty());
}

TEST_F(profile_command, monitor_prints_what_comes_and_changes_nothing) {
    put_both_halves();
    nrx::profile_record record{};
    record.bytes.fill(1);
    record.bytes[0] = 3;
    const std::string text = capture([&] { nrx::print_profile_record(record); }).out;
    for (const auto& [words, duration, out] : rows<std::string, std::string, std::string>{
             {"monitor", "00 00 00 00",
              "duration=0 us mode=auto (humanReadable=disabled)\n" + dumped(3, 1)},
             {"monitor human 250", "90 d0 03 00",
              "duration=250000 us mode=enable (humanReadable=enabled)\n" + text},
         }) {
        driver->queue->add(record_bytes(3, 1));
        driver->queue->add(record_bytes(0, 0));
        const std::ptrdiff_t before = std::ssize(logged("call"));
        says(words, out + "done\n");
        const lines calls = logged("call");
        EXPECT_EQ(lines(calls.begin() + before, calls.end()),
                  (lines{"call profile 1 scalars [0xd2] in [" + duration + "] results 0 room 0",
                         "call profile 2 scalars [0xd1] in [] results 0 room 65536"}));
    }
}

TEST_F(profile_command, run_configures_enables_monitors_and_puts_everything_back) {
    put_both_halves();
    driver->queue->add(record_bytes(3, 1));
    driver->queue->add(record_bytes(0, 0));
    says("250 uart:uart0:test",
         "duration=250000 us mode=enable (humanReadable=disabled)\n" + dumped(3, 1) + "done\n");
    const std::string test_on = config_bytes("06", "00", "00", "80 00 00 00");
    std::string test_off = test_on;
    test_off[25] = '1';
    EXPECT_EQ(
        logged("call"),
        (lines{"call profile 3 scalars [0x24] in [" + test_on + "] results 0 room 0",
               "call KeltoNRXProfileDriver 2 scalars [] in [" + test_on + "] results 0 room 0",
               enable_call, "call profile 1 scalars [0xd2] in [90 d0 03 00] results 0 room 0",
               "call profile 2 scalars [0xd1] in [] results 0 room 65536",
               "call profile 3 scalars [0x24] in [" + test_off + "] results 0 room 0",
               "call KeltoNRXProfileDriver 2 scalars [] in [" + test_off + "] results 0 room 0",
               disable_call}));
}

TEST_F(profile_command, run_stops_at_the_first_failure) {
    EXPECT_EQ(profile("sensor:accel").out, "duration parameter is invalid (sensor:accel)\n");
    EXPECT_EQ(profile("human auto sensor").err,
              failed(grammar_file, "result") + failed(run_file, "success"));
    EXPECT_TRUE(happened().empty());
    says("auto",
         "duration=0 us mode=auto (humanReadable=disabled)\n"
         "kext config: At least one config failed\n",
         failed(conn_file, "service") + failed(apply_file, "success") +
             failed(conn_file, "service") + failed(kernel_file, "success") +
             failed(run_file, "success"));
    put_both_halves();
    driver->answers[2] = {{.code = platform::no_memory}};
    EXPECT_TRUE(profile("auto").err.ends_with(failed(run_file, "success")));
    EXPECT_EQ(logged("call").size(), 2U);
    driver->answers[2] = {};
    driver->queue = nullptr;
    EXPECT_EQ(profile("auto").err, failed(conn_file, "kr == 0 ", unsupported_text) +
                                       failed(monitor_file, "success") +
                                       failed(run_file, "success"));
    EXPECT_EQ(logged("call").size(), 5U);
}

TEST_F(profile_command, run_disables_nothing_after_a_failure_of_its_own) {
    put_both_halves();
    driver->answers[0] = {{.code = platform::unsupported}};
    EXPECT_EQ(profile("auto").err,
              failed(kernel_file, "kr == 0 ", unsupported_text) + failed(run_file, "success"));
    EXPECT_EQ(times(enable_call), 1);
    driver->answers[0] = {};
    driver->queue->add(byte_list(49, 3));  // no room for it in a record
    EXPECT_TRUE(profile("auto").err.ends_with(failed(run_file, "success")));
    EXPECT_EQ(times(enable_call), 2);
    EXPECT_EQ(times(disable_call), 0);
    // What puts everything back may fail, and goes on all the same.
    driver->queue->clear();
    driver->queue->add(record_bytes(0, 0));
    driver->answers[2] = {{}, {.code = platform::no_memory}};
    const outcome refused = profile("auto");
    EXPECT_TRUE(refused.out.ends_with("done\n"));
    EXPECT_EQ(refused.err, failed(apply_file, "result == 0 ", no_memory_text));
    EXPECT_EQ(times(disable_call), 1);
}

TEST_F(profile_command, interrupt_during_any_subcommand_asks_once_for_the_end_of_the_stream) {
    put_both_halves();
    driver->actions[0] = [] { std::raise(SIGINT); };
    EXPECT_EQ(profile("enable").err, "");
    EXPECT_EQ(logged("call"), (lines{enable_call, end_stream_call}));
    driver->actions.clear();
    std::ptrdiff_t served = 1;
    for (const char* words : {"clear-eventsources", "eventsources", "wqrfw-wakestats", "enable",
                              "disable", "stop", "flush", "get-config", "config wake:all",
                              "signal-errdump", "get-logs", "on-error panic"}) {
        host.before_call(1, [] { std::raise(SIGINT); });
        profile(words);
        EXPECT_EQ(times(end_stream_call), ++served) << words;
    }
}

}  // namespace tests
