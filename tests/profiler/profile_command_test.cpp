#include "nrxctl/profiler/profile_command.h"

#include <csignal>

#include "nrxctl/base/tick_period.h"
#include "platform/clock.h"
#include "platform/virtual/profiler/profiler.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

using lines = std::vector<std::string>;

namespace {

constexpr const char* conn = "profiler/profiler_conn.cpp";
constexpr const char* kernel = "profiler/kernel_profiler.cpp";
constexpr const char* channel_file = "base/channel.cpp";
constexpr const char* command_file = "base/command_channel.cpp";
constexpr const char* state_file = "profiler/state_subcommands.cpp";
constexpr const char* statistics_file = "profiler/statistics_subcommands.cpp";
constexpr const char* log_file = "profiler/log_subcommands.cpp";
constexpr const char* monitor_file = "profiler/monitor_subcommands.cpp";
constexpr const char* unsupported_text = "unsupported request (0xe00002c7)";
constexpr const char* no_service_text = "service not found (0xe00002f0)";
constexpr const char* io_text = "device i/o failure (0xe0000401)";

// The calls of one operation on a half of the profiler.
lines exchange(const std::string& name, const std::string& call) {
    return {"open " + name + " type 0", "call " + name + " " + call, "close " + name};
}

byte_list event_source(std::string name, std::uint32_t first) {
    name.resize(36);
    return joined(
        {byte_list(name.begin(), name.end()),
         words_of({first, first + 1, first + 2, first + 3, first + 4, first + 5, first + 6})});
}

}  // namespace

class profile_command : public profiler_test {
protected:
    void TearDown() override {
        EXPECT_TRUE(has_default_action());
        profiler_test::TearDown();
    }
};

TEST_F(profile_command, help_prints_the_usage) {
    EXPECT_EQ(profile({"help", "ignored"}).out,
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
    struct request_row {
        lines words;
        std::string name;
        std::string call;
    };
    const std::vector<request_row> rows{
        {{"enable"}, driver_name, "0 scalars [0x1] in [] results 0 room 0"},
        {{"disable"}, driver_name, "0 scalars [0x0] in [] results 0 room 0"},
        {{"signal-errdump"}, driver_name, "10 scalars [] in [] results 0 room 0"},
        {{"stop"}, "profile", "3 scalars [0x21] in [] results 0 room 0"},
        {{"flush"}, "profile", "3 scalars [0x23] in [] results 0 room 0"},
        {{"clear-eventsources"},
         "profile",
         "3 scalars [0x20] in [00 00 00 00 00 00 00 00] results 0 room 0"},
        {{"on-error", "panic"}, "profile", "1 scalars [0xd5] in [01 00 00 00] results 0 room 0"},
        {{"on-error", "nothing"}, "profile", "1 scalars [0xd5] in [00 00 00 00] results 0 room 0"},
    };
    for (const request_row& row : rows) {
        const outcome written = profile(row.words);
        EXPECT_EQ(written.out + written.err, "") << row.words[0];
        EXPECT_EQ(happened(), exchange(row.name, row.call)) << row.words[0];
    }
}

TEST_F(profile_command, requests_to_missing_halves_are_reported_or_not_made) {
    const std::string no_driver = failed(conn, "service") + failed(kernel, "success");
    const std::string no_profile = failed(channel_file, "service");
    struct missing_row {
        lines words;
        std::string reports;
    };
    const std::vector<missing_row> rows{
        {{"enable"}, no_driver},
        {{"disable"}, no_driver},
        {{"signal-errdump"}, ""},
        {{"stop"}, ""},
        {{"flush"}, ""},
        {{"clear-eventsources"}, no_profile + failed(statistics_file, "kr == 0 ", no_service_text)},
        {{"eventsources"}, no_profile + failed(statistics_file, "kr == 0 ", no_service_text)},
        {{"wqrfw-wakestats"}, no_profile + failed(statistics_file, "kr == 0 ", no_service_text)},
        {{"on-error", "panic"}, no_profile + failed(log_file, "kr == 0 ", no_service_text)},
        {{"get-config"}, failed(conn, "service") + failed(state_file, "success")},
    };
    for (const missing_row& row : rows) {
        const outcome written = profile(row.words);
        EXPECT_EQ(written.err, row.reports) << row.words[0];
        EXPECT_EQ(written.out, "") << row.words[0];
    }
}

TEST_F(profile_command, refused_requests_are_reported_by_each_who_checks) {
    put_both_halves();
    for (const std::uint32_t code : {0x21U, 0x23U}) {
        service->set_command(
            code, [](platform::byte_view, byte_list&) { return platform::simulated::io_failure; });
    }
    service->drop_report(0xd5);
    driver->answers[0] = driver->answers[10] = {{.code = platform::unsupported}};
    EXPECT_EQ(profile({"stop"}).err, failed(command_file, "kr == 0 ", io_text));
    EXPECT_EQ(profile({"flush"}).err,
              failed(command_file, "kr == 0 ", io_text) + failed(state_file, "kr == 0 ", io_text));
    EXPECT_EQ(profile({"on-error", "nothing"}).err,
              failed(command_file, "kr == 0 ", unsupported_text) +
                  failed(log_file, "kr == 0 ", unsupported_text));
    EXPECT_EQ(profile({"enable"}).err, failed(kernel, "kr == 0 ", unsupported_text));
    EXPECT_EQ(profile({"signal-errdump"}).err, failed(kernel, "kr == 0 ", unsupported_text));
}

TEST_F(profile_command, event_sources_are_a_table) {
    put_both_halves();
    const std::string header =
        "thread           eventsource function   context    count      total_time max_time   "
        "max_latency\n";
    byte_list rows = joined({event_source("a_thread_of_20_chars", 0xfffffff0),
                             event_source("idle", 9), byte_list(36, 'x')});
    service->set_command(0x20, [&](platform::byte_view, byte_list& reply) {
        reply = rows;
        return platform::success;
    });
    EXPECT_EQ(profile({"eventsources"}).out,
              header +
                  "a_thread_of_20_c   fffffff0   fffffff1   fffffff2 4294967283 4294967284 "
                  "4294967285 4294967286\n"
                  "idle                      9          a          b         12         13"
                  "         14         15\n");
    EXPECT_EQ(happened(), exchange("profile",
                                   "3 scalars [0x20] in [00 00 00 00 01 00 00 00] "
                                   "results 0 room 12800"));
    rows.resize(63);
    EXPECT_EQ(profile({"get-eventsources"}).out, header);
    rows.clear();
    EXPECT_EQ(profile({"get-eventsources"}).out, header);
}

TEST_F(profile_command, wake_requests_are_a_table_of_27_names) {
    put_both_halves();
    byte_list counts = words_of({0xffffffff, 16, 0});
    service->set_command(0x20, [&](platform::byte_view, byte_list& reply) {
        reply = counts;
        return platform::success;
    });
    const std::string header = "wake_reason      wake_req_count \n";
    EXPECT_EQ(profile({"wqrfw-wakestats"}).out, header +
                                                    "nrx_none           ffffffff \n"
                                                    "nrx                      10 \n"
                                                    "nrx_queue_overfl          0 \n");
    EXPECT_EQ(happened(), exchange("profile",
                                   "3 scalars [0x20] in [0a 00 00 00 00 00 00 00] "
                                   "results 0 room 108"));
    counts.resize(3);
    EXPECT_EQ(profile({"wqrfw-wakestats"}).out, header);
    counts.assign(108, 0);
    std::string all = header;
    for (const char* name :
         {"nrx_none        ", "nrx             ", "nrx_queue_overfl", "nrx_ferrin      ",
          "nrx_corvane     ", "nrx_activity_ala", "nrx_sedintary_al", "nrx_gesture     ",
          "nrx_touch       ", "voice_trigger   ", "nrx_velm_reset  ", "audio           ",
          "nrx_aggregate_di", "nrx_als         ", "nrx_reset_slave ", "nrx_SCMHIDDebug ",
          "nrx_READY       ", "nrx_rtp_hr      ", "nrx_rtp_tamo    ", "nrx_kpdx        ",
          "nrx_zarn_reset  ", "wqr_flapcase    ", "nrx_slave       ", "nrx_rtp_ctrl    ",
          "wqr_ttw         ", "wqr_pellix_unplu", "nrx_unknown     "}) {
        all += std::string(name) + "          0 \n";
    }
    EXPECT_EQ(profile({"wqrfw-wakestats"}).out, all);
}

TEST_F(profile_command, config_prints_and_applies_what_the_words_say) {
    put_both_halves();
    EXPECT_EQ(profile({"config", "sensor:accel:data", "exec:packet"}).out,
              "    profiler sensor     is enabled [component=accel, reports=4]\n"
              "    profiler exec       is enabled [component=command, reports=ffffffff services= "
              "all]\n");
    EXPECT_EQ(logged("call").size(), 2U);
    EXPECT_EQ(profile({"set-config"}).err, "");
    EXPECT_EQ(logged("call").size(), 4U);
    driver->answers[2] = {{.code = platform::no_memory}};
    EXPECT_EQ(profile({"config"}).err,
              failed("profiler/apply_configs.cpp", "result == 0 ", "out of memory (0xe00002bd)") +
                  failed(state_file, "success"));
}

TEST_F(profile_command, config_sends_nothing_after_a_word_that_fails) {
    put_both_halves();
    const outcome written = profile({"config", "sensor:accel", "sensor:7"});
    const std::string grammar = "profiler/config_grammar.cpp";
    EXPECT_EQ(written.out, "");
    EXPECT_EQ(written.err, failed(grammar, "enable_num_components") + failed(grammar, "result") +
                               failed(grammar, "result") + failed(state_file, "success"));
    EXPECT_TRUE(host.log().empty());
    EXPECT_EQ(profile({"config", "scm:x"}).out, "component is invalid (x)\n");
}

TEST_F(profile_command, get_config_shows_both_halves) {
    put_both_halves();
    const byte_list record = joined({words_of({2, 1, 0, 4}), byte_list(36, 0)});
    driver->answers[1] = {{.scalar = 1}, {.scalar = 0}};
    driver->answers[3] = {{.bytes = joined({record, record, {1, 2}})},
                          {.code = platform::unsupported},
                          {.bytes = byte_list(51, 0)}};
    service->set_report(0xd0, record);
    const std::string gyro = "    profiler sensor     is enabled [component=gyro, reports=4]\n";
    EXPECT_EQ(profile({"get-config"}).out, "A client is connected\n\nActive components in kext:\n" +
                                               gyro + gyro + "\nActive components in fw:\n" + gyro);
    EXPECT_EQ(logged("call"),
              (lines{"call KeltoNRXProfileDriver 1 scalars [] in [] results 1 room 0",
                     "call KeltoNRXProfileDriver 3 scalars [] in [] results 0 room 1040",
                     "call profile 2 scalars [0xd0] in [] results 0 room 1040"}));
    service->drop_report(0xd0);
    const std::string none =
        "No client is connected\n\nActive components in kext:\n    none\n\nActive components in "
        "fw:\n    none\n";
    outcome written = profile({"get-config"});
    EXPECT_EQ(written.out + written.err, none);
    service->set_report(0xd0, byte_list(51, 1));
    EXPECT_EQ(profile({"get-config"}).out, none);
    host.remove("profile");
    EXPECT_EQ(profile({"get-config"}).out,
              "No client is connected\n\nActive components in kext:\n    none\n\nActive components "
              "in fw:\n    fw profiler is not available\n");
}

TEST_F(profile_command, get_logs_prints_the_logs_that_the_words_name) {
    const std::string firmware = dumped(3, 1) + dumped(3, 2) + "\n\n";
    const std::string errors = "errdump\n" + dumped(3, 5) + "\n\n";
    struct log_row {
        lines words;
        std::string out;
    };
    const std::vector<log_row> rows{
        {{"get-logs"}, firmware},
        {{"get-logs", "fwdump"}, firmware},
        {{"get-logs", "errdump"}, errors},
        {{"get-logs", "errdump", "fwdump"}, firmware + errors},
    };
    for (const log_row& row : rows) {
        machine other;
        const platform::simulated::installed_machine installed(other);
        auto scripted = std::make_shared<scripted_driver>();
        scripted->answers[9] = {{.bytes = record_bytes(3, 2)}, {}};
        scripted->answers[8] = {{.bytes = record_bytes(3, 5)}, {}};
        other.add({.name = driver_name, .unit = scripted});
        bool read = false;
        put_service(other, "profile", 1)
            .set_report_source(0xd1, [&](std::size_t, byte_list& reply) {
                if (!std::exchange(read, true)) reply = record_bytes(3, 1);
                return platform::success;
            });
        const outcome written = profile(row.words);
        EXPECT_EQ(written.out, row.out) << row.words.size();
        EXPECT_EQ(written.err, "");
    }
}

TEST_F(profile_command, get_logs_decodes_for_humans_and_refuses_other_words) {
    put_both_halves();
    driver->answers[9] = {{.bytes = record_bytes(0, 0)}, {}};
    EXPECT_TRUE(profile({"get-logs", "human"}).out.starts_with("{  'category':  'exec',"));
    EXPECT_EQ(happened().size(), 8U);
    const outcome written = profile({"get-logs", "fwdump", "Human", "errdump"});
    EXPECT_EQ(written.out, "Invalid parameter\n");
    EXPECT_EQ(written.err, failed(log_file, "false"));
    EXPECT_TRUE(happened().empty());
}

TEST_F(profile_command, get_logs_reads_what_there_is_of_the_two_halves) {
    put_driver();
    driver->answers[9] = {{.bytes = record_bytes(3, 1)}, {}};
    const outcome no_service = profile({"get-logs"});
    EXPECT_EQ(no_service.out, dumped(3, 1) + "\n\n");
    EXPECT_EQ(no_service.err, failed("base/channel.cpp", "service") +
                                  failed("base/profile_records.cpp", "result == 0 ",
                                         "service not found (0xe00002f0)"));
    host.remove(driver_name);
    put_profile_service();
    const outcome no_driver = profile({"get-logs", "fwdump", "errdump"});
    EXPECT_EQ(no_driver.out, "\n\nerrdump\n\n\n");
    EXPECT_EQ(no_driver.err, "");
}

TEST_F(profile_command, subcommands_take_their_own_words_and_no_other) {
    put_both_halves();
    driver->queue->add(record_bytes(0, 0));
    struct row {
        std::vector<std::string> words;
        int taken;
    };
    const std::vector<row> rows{
        {{"help", "x"}, 0},
        {{"enable", "x"}, 0},
        {{"on-error", "panic", "x"}, 1},
        {{"on-error", "Panic", "x"}, 1},
        {{"monitor", "auto", "human"}, 1},
        {{"get-logs", "fwdump", "bad", "errdump"}, 2},
        {{"config", "sensor:accel", "bad", "sensor:gyro"}, 2},
        {{"config", "sensor:accel", "sensor:gyro"}, 2},
    };
    for (const row& one : rows) {
        profile(one.words);
        EXPECT_EQ(taken, one.taken) << ::testing::PrintToString(one.words);
    }
}

TEST_F(profile_command, on_error_refuses_other_words_and_a_missing_one) {
    put_both_halves();
    EXPECT_EQ(profile({"on-error", "Panic"}).out, "invalid argument: Panic\n");
    EXPECT_EQ(profile({"on-error"}).out, "invalid argument: \n");
    EXPECT_TRUE(happened().empty());
}

TEST_F(profile_command, run_configures_enables_monitors_and_puts_everything_back) {
    put_both_halves();
    driver->queue->add(record_bytes(3, 1));
    driver->queue->add(record_bytes(0, 0));
    const outcome written = profile({"250", "uart:uart0:test"});
    EXPECT_EQ(written.out, "duration=250000 us mode=enable (humanReadable=disabled)\n" +
                               dumped(3, 1) + "done\n");
    EXPECT_EQ(written.err, "");
    const std::string test_on =
        "06 00 00 00 00 00 00 00 00 00 00 00 80 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 "
        "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00";
    std::string test_off = test_on;
    test_off[25] = '1';
    EXPECT_EQ(
        logged("call"),
        (lines{"call profile 3 scalars [0x24] in [" + test_on + "] results 0 room 0",
               "call KeltoNRXProfileDriver 2 scalars [] in [" + test_on + "] results 0 room 0",
               "call KeltoNRXProfileDriver 0 scalars [0x1] in [] results 0 room 0",
               "call profile 1 scalars [0xd2] in [90 d0 03 00] results 0 room 0",
               "call profile 2 scalars [0xd1] in [] results 0 room 65536",
               "call profile 3 scalars [0x24] in [" + test_off + "] results 0 room 0",
               "call KeltoNRXProfileDriver 2 scalars [] in [" + test_off + "] results 0 room 0",
               "call KeltoNRXProfileDriver 0 scalars [0x0] in [] results 0 room 0"}));
}

TEST_F(profile_command, run_leaves_nothing_active_on_a_device_that_takes_what_it_is_told) {
    nrx::tick_period = platform::tick_period();
    serve_profile(put_service(host, "profile", 0x50),
                  platform::simulated::add_profiler_driver(host));
    EXPECT_NE(profile({"40", "sensor:accel:data"}).out.find("prof-event 02020002"),
              std::string::npos);
    EXPECT_EQ(profile({"get-config"}).out,
              "No client is connected\n\nActive components in kext:\n    none\n\nActive components "
              "in fw:\n    none\n");
}

TEST_F(profile_command, run_stops_at_the_first_failure) {
    EXPECT_EQ(profile({"sensor:accel"}).out, "duration parameter is invalid (sensor:accel)\n");
    EXPECT_EQ(profile({"human", "auto", "sensor"}).err,
              failed("profiler/config_grammar.cpp", "result") + failed(monitor_file, "success"));
    EXPECT_TRUE(happened().empty());
    const outcome unconnected = profile({"auto"});
    EXPECT_EQ(unconnected.out,
              "duration=0 us mode=auto (humanReadable=disabled)\n"
              "kext config: At least one config failed\n");
    EXPECT_EQ(unconnected.err, failed(conn, "service") +
                                   failed("profiler/apply_configs.cpp", "success") +
                                   failed(conn, "service") + failed(kernel, "success") +
                                   failed(monitor_file, "success"));
    put_both_halves();
    driver->answers[2] = {{.code = platform::no_memory}};
    EXPECT_TRUE(profile({"auto"}).err.ends_with(failed(monitor_file, "success")));
    EXPECT_EQ(logged("call").size(), 2U);
    driver->answers[2] = {};
    driver->queue = nullptr;
    EXPECT_EQ(profile({"auto"}).err, failed(conn, "kr == 0 ", unsupported_text) +
                                         failed("profiler/monitor.cpp", "success") +
                                         failed(monitor_file, "success"));
    EXPECT_EQ(logged("call").size(), 5U);
}

TEST_F(profile_command, run_disables_nothing_after_a_failure_of_its_own) {
    const std::string enable_call =
        "call KeltoNRXProfileDriver 0 scalars [0x1] in [] results 0 room 0";
    const std::string disable_call =
        "call KeltoNRXProfileDriver 0 scalars [0x0] in [] results 0 room 0";
    const auto times = [&](const std::string& call) {
        const auto calls = logged("call");
        return std::count(calls.begin(), calls.end(), call);
    };
    put_both_halves();
    driver->answers[0] = {{.code = platform::unsupported}};
    EXPECT_EQ(profile({"auto"}).err,
              failed(kernel, "kr == 0 ", unsupported_text) + failed(monitor_file, "success"));
    EXPECT_EQ(times(enable_call), 1);
    driver->answers[0] = {};
    driver->queue->add(byte_list(49, 3));  // no room for it in a record
    EXPECT_TRUE(profile({"auto"}).err.ends_with(failed(monitor_file, "success")));
    EXPECT_EQ(times(enable_call), 2);
    EXPECT_EQ(times(disable_call), 0);
    // What puts everything back may fail, and goes on all the same.
    driver->queue->clear();
    driver->queue->add(record_bytes(0, 0));
    driver->answers[2] = {{}, {.code = platform::no_memory}};
    const outcome refused = profile({"auto"});
    EXPECT_TRUE(refused.out.ends_with("done\n"));
    EXPECT_EQ(refused.err,
              failed("profiler/apply_configs.cpp", "result == 0 ", "out of memory (0xe00002bd)"));
    EXPECT_EQ(times(disable_call), 1);
}

TEST_F(profile_command, interrupt_during_any_subcommand_asks_for_the_end_of_the_stream) {
    put_both_halves();
    driver->actions[0] = [] { std::raise(SIGINT); };
    EXPECT_EQ(profile({"enable"}).err, "");
    EXPECT_EQ(logged("call"),
              (lines{"call KeltoNRXProfileDriver 0 scalars [0x1] in [] results 0 room 0",
                     "call KeltoNRXProfileDriver 11 scalars [] in [] results 0 room 0"}));
    driver->answers[11] = {{.code = platform::unsupported}};
    EXPECT_EQ(profile({"enable"}).err, failed(kernel, "kr == 0 ", unsupported_text));
}

TEST_F(profile_command, interrupt_at_the_first_call_of_each_subcommand_is_served_once) {
    put_both_halves();
    const std::string stop_call = "call KeltoNRXProfileDriver 11 scalars [] in [] results 0 room 0";
    const std::vector<std::vector<std::string>> subcommands{
        {"clear-eventsources"},
        {"eventsources"},
        {"wqrfw-wakestats"},
        {"enable"},
        {"disable"},
        {"stop"},
        {"flush"},
        {"get-config"},
        {"config", "sensor:accel"},
        {"signal-errdump"},
        {"get-logs"},
        {"on-error", "panic"},
    };
    std::ptrdiff_t served = 0;
    for (const auto& words : subcommands) {
        host.before_call(1, [] { std::raise(SIGINT); });
        profile(words);
        const auto calls = logged("call");
        EXPECT_EQ(std::count(calls.begin(), calls.end(), stop_call), ++served) << words[0];
    }
}

}  // namespace tests
