#include "nrxctl/profiler/profile_command.h"

#include <csignal>

#include "nrxctl/decoders/record_text.h"
#include "tests/golden/golden_text.h"
#include "tests/profiler/profiler_host.h"
#include "tests/support/argument_vector.h"

namespace tests {

const std::string event_source_header =
    "thread           eventsource function   context    count      total_time max_time   "
    "max_latency\n";
const std::string wake_header = "wake_reason      wake_req_count \n";
const std::string auto_line = "duration=0 us mode=auto (humanReadable=disabled)\n";
const std::string control_report = library_report(file::control_subcommands, "success");
const std::string parser_report = library_report(file::config_parser, "result");
const std::string no_memory_report =
    library_report(file::apply_configs, "result == 0 ", no_memory_text);
const std::string no_driver_report = library_report(file::kernel_profiler, "service");

struct profile_command : profiler_test {
    void expect(const std::string& command_line, const std::string& out,
                const std::string& reports = "") {
        const outcome written = profile(command_line);
        EXPECT_EQ(written.out, out) << command_line;
        EXPECT_EQ(written.err, reports) << command_line;
    }
};

TEST_F(profile_command, help_prints_the_usage) {
    expect("help ignored", golden_text("profile_help.txt"));
    EXPECT_TRUE(host.log().empty());
}

TEST_F(profile_command, simple_request_is_one_call_whose_failure_is_reported) {
    // A subcommand, its call and output; the file that reports a failure of the call, and whether a
    // missing half is reported.
    const rows<std::string, std::string, std::string, const char*, bool> cases{
        {"enable", "driver 0 [0x1]", "", file::kernel_profiler, true},
        {"disable", "driver 0 [0x0]", "", file::kernel_profiler, true},
        {"signal-errdump", "driver 10 []", "", file::kernel_profiler, false},
        {"stop", "profile 3 [0x21]", "", nullptr, false},
        {"flush", "profile 3 [0x23]", "", file::control_subcommands, false},
        {"on-error panic", "profile 1 [0xd5] in [01 00 00 00]", "", file::control_subcommands,
         true},
        {"on-error nothing", "profile 1 [0xd5] in [00 00 00 00]", "", file::control_subcommands,
         true},
        {"clear-eventsources", "profile 3 [0x20] in [00 00 00 00 00 00 00 00]", "",
         file::statistics_subcommands, true},
        {"eventsources", "profile 3 [0x20] in [00 00 00 00 01 00 00 00] capacity 12800",
         event_source_header, file::statistics_subcommands, true},
        {"wqrfw-wakestats", "profile 3 [0x20] in [0a 00 00 00 00 00 00 00] capacity 108",
         wake_header, file::statistics_subcommands, true}};
    const auto is_for_driver = [](const std::string& call) { return call.starts_with("driver"); };
    for (const auto& [command_line, call, out, source, _] : cases) {
        new_calls();
        const std::size_t calls_before = host.calls_made();
        expect(command_line, out);
        EXPECT_EQ(new_calls(), call + "\n");
        host.fail_call(host.calls_made() - calls_before, failure::io);
        expect(command_line, "",
               (is_for_driver(call) ? "" : kr_report(file::command_channel, io_text)) +
                   (source == nullptr ? "" : kr_report(source, io_text)));
    }
    remove_driver();
    remove_service();
    for (const auto& [command_line, call, _, source, is_reported] : cases) {
        expect(command_line, "",
               !is_reported ? ""
               : is_for_driver(call)
                   ? no_driver_report + library_report(source, "success")
                   : library_report(file::channel, "service") + kr_report(source, not_found_text));
    }
}

TEST_F(profile_command, event_sources_are_a_table_of_complete_rows) {
    const auto event_source = [](std::string name, std::uint64_t n) {
        name.resize(36);
        return joined({byte_list(name.begin(), name.end()),
                       u32_report({n, n + 1, n + 2, n + 3, n + 4, n + 5, n + 6})});
    };
    set_reply(0x20, platform::success,
              joined({event_source("a_thread_of_20_chars", 0xfffffff0), event_source("idle", 9),
                      byte_list(63, 'x')}));
    expect("get-eventsources",
           event_source_header +
               "a_thread_of_20_c   fffffff0   fffffff1   fffffff2 4294967283 4294967284 "
               "4294967285 4294967286\n"
               "idle                      9          a          b         12         13         14"
               "         15\n");
}

TEST_F(profile_command, wake_requests_are_a_table_of_27_names) {
    byte_list counts = u32_report({0xffffffff, 16});
    counts.resize(108);
    set_reply(0x20, platform::success, counts);
    const std::string first = wake_header + "nrx_none           ffffffff \n";
    std::string all = first + "nrx                      10 \n";
    for (const std::string& name : split(
             "nrx_queue_overfl|nrx_ferrin      |nrx_corvane     |nrx_activity_ala|nrx_sedintary_al|"
             "nrx_gesture     |nrx_touch       |voice_trigger   |nrx_velm_reset  |audio           |"
             "nrx_aggregate_di|nrx_als         |nrx_reset_slave |nrx_SCMHIDDebug |nrx_READY       |"
             "nrx_rtp_hr      |nrx_rtp_tamo    |nrx_kpdx        |nrx_zarn_reset  |wqr_flapcase    |"
             "nrx_slave       |nrx_rtp_ctrl    |wqr_ttw         |wqr_pellix_unplu|nrx_unknown     ",
             '|'))
        all += name + "          0 \n";
    expect("wqrfw-wakestats", all);
    counts.resize(7);
    set_reply(0x20, platform::success, counts);
    expect("wqrfw-wakestats", first);
}

TEST_F(profile_command, config_prints_and_applies_valid_arguments) {
    expect("config sensor:accel sensor", "", parser_report + control_report);
    expect("config scm:x", "component is invalid (x)\n");
    EXPECT_EQ(new_calls(), "");
    expect("config sensor:accel:data exec:packet",
           "    profiler sensor     is enabled [component=accel, reports=4]\n"
           "    profiler exec       is enabled [component=command, reports=ffffffff services= "
           "all]\n");
    new_calls();
    expect("set-config", "");
    EXPECT_EQ(new_calls(), "profile 3 [0x24]\ndriver 2 []\n");
    driver->replies[2] = {{.code = platform::no_memory}};
    expect("config", "", no_memory_report + control_report);
}

TEST_F(profile_command, get_config_shows_both_halves) {
    const byte_list record = joined({u32_report({2, 1, 0, 4}), byte_list(36, 0)});
    driver->replies[1] = {{.scalar = 0x100000000}, {}, {}, {.code = platform::unsupported}};
    driver->replies[3] = {{.bytes = joined({record, record, {1, 2}})},
                          {.code = platform::unsupported},
                          {.bytes = byte_list(51, 0)}};
    service->set_report(0xd0, record);
    const std::string gyro = "    profiler sensor     is enabled [component=gyro, reports=4]\n";
    const std::string kext = " client is connected\n\nActive components in kext:\n";
    const std::string fw = "\nActive components in fw:\n";
    const std::string none = "No" + kext + "    none\n" + fw;
    expect("get-config", "A" + kext + gyro + gyro + fw + gyro);
    EXPECT_EQ(new_calls(),
              "driver 1 [] results 1\ndriver 3 [] capacity 1040\nprofile 2 [0xd0] capacity 1040\n");
    service->drop_report(0xd0);
    expect("get-config", none + "    none\n");
    service->set_report(0xd0, byte_list(51, 1));
    expect("get-config", none + "    none\n");
    remove_service();
    host.fail_call(5, failure::empty_result);  // the status comes without a scalar
    expect("get-config", none + "    fw profiler is not available\n");
    expect("get-config", "", kr_report(file::kernel_profiler, unsupported_text) + control_report);
    remove_driver();
    expect("get-config", "", no_driver_report + control_report);
}

TEST_F(profile_command, get_logs_prints_the_logs_that_are_named) {
    const std::string firmware = dumped(3, 1) + dumped(3, 2) + "\n\n";
    const std::string errors = "errdump\n" + dumped(3, 5) + "\n\n";
    for (const auto& [command_line, out] :
         rows<std::string, std::string>{{"get-logs", firmware},
                                        {"get-logs fwdump", firmware},
                                        {"get-logs errdump", errors},
                                        {"get-logs errdump fwdump", firmware + errors}}) {
        driver->replies[9] = {{.bytes = record_bytes(3, 2)}, {}};
        driver->replies[8] = {{.bytes = record_bytes(3, 5)}, {}};
        set_fw_log(record_bytes(3, 1));
        expect(command_line, out);
    }
    driver->replies[9] = {{.bytes = end_marker}, {}};
    EXPECT_TRUE(profile("get-logs human").out.starts_with("{  'category':  'exec',"));
    new_events();
    expect("get-logs fwdump Human errdump", "Invalid parameter\n",
           library_report(file::log_subcommands, "false"));
    expect("on-error Panic", "invalid argument: Panic\n");
    expect("on-error", "invalid argument: \n");
    EXPECT_EQ(new_events(), "");
}

TEST_F(profile_command, subcommand_reads_its_own_arguments_only) {
    driver->queue->add(end_marker);
    const std::map<std::string, int> counts{{"help x", 0},
                                            {"enable x", 0},
                                            {"on-error panic x", 1},
                                            {"on-error Panic x", 1},
                                            {"monitor auto human", 1},
                                            {"get-logs fwdump bad errdump", 2},
                                            {"config sensor:accel bad sensor:gyro", 2}};
    for (const auto& [command_line, count] : counts) {
        profile(command_line);
        EXPECT_EQ(arguments_read, count) << command_line;
    }
}

TEST_F(profile_command, monitor_prints_and_run_configures_and_enables_too) {
    const byte_list record = record_bytes(3, 1);
    const std::string text =
        capture([&] { nrx::print_complete_records(record, nrx::print_profile_record); }).out;
    const std::string human_line = "duration=250000 us mode=enable (humanReadable=enabled)\n";
    const std::string read_log = "profile 2 [0xd1] capacity 65536\n";
    const std::string monitor_calls = "profile 1 [0xd2] in [90 d0 03 00]\n" + read_log;
    const std::string enabled = " in [06 00 00 00 00 00 00 00 00 00 00 00 80 00 00 00 zeros]\n";
    const std::string disabled = " in [06 00 00 00 00 00 00 00 01 00 00 00 80 00 00 00 zeros]\n";
    for (const auto& [command_line, out, calls] : rows<std::string, std::string, std::string>{
             {"monitor", auto_line + dumped(3, 1),
              "profile 1 [0xd2] in [00 00 00 00]\n" + read_log},
             {"monitor human 250", human_line + text, monitor_calls},
             {"human 250 uart:uart0:test", human_line + text,
              "profile 3 [0x24]" + enabled + "driver 2 []" + enabled + "driver 0 [0x1]\n" +
                  monitor_calls + "profile 3 [0x24]" + disabled + "driver 2 []" + disabled +
                  "driver 0 [0x0]\n"}}) {
        driver->queue->add(record);
        driver->queue->add(end_marker);
        expect(command_line, out + "done\n");
        EXPECT_EQ(new_calls(), calls) << command_line;
    }
}

TEST_F(profile_command, run_ends_at_the_first_failure_without_disabling) {
    const std::string configure = "profile 3 [0x24]\ndriver 2 []\n";
    const std::string unsupported = kr_report(file::kernel_profiler, unsupported_text);
    expect("sensor:accel", "duration parameter is invalid (sensor:accel)\n");
    expect("auto sensor", auto_line, parser_report + control_report);
    EXPECT_EQ(new_calls(), "");
    driver->replies[2] = {{.code = platform::no_memory}, {}};
    expect("auto", auto_line, no_memory_report + control_report);
    EXPECT_EQ(new_calls(), configure);
    driver->replies[0] = {{.code = platform::unsupported}, {}};
    expect("auto", auto_line, unsupported + control_report);
    EXPECT_EQ(new_calls(), configure + "driver 0 [0x1]\n");
    const auto queue = std::exchange(driver->queue, nullptr);
    expect("auto", auto_line,
           unsupported + library_report(file::monitor, "success") + control_report);
    EXPECT_EQ(new_calls(), configure + "driver 0 [0x1]\n");
    // The last configuration may fail: the profiler is disabled all the same.
    driver->queue = queue;
    driver->queue->add(end_marker);
    driver->replies[2] = {{}, {.code = platform::no_memory}};
    expect("auto", auto_line + "done\n", no_memory_report);
    EXPECT_TRUE(new_calls().ends_with("driver 2 []\ndriver 0 [0x0]\n"));
}

TEST_F(profile_command, interrupt_during_a_subcommand_ends_the_stream) {
    driver->actions[0] = [] { std::raise(SIGINT); };
    expect("enable", "");
    EXPECT_EQ(new_calls(), "driver 0 [0x1]\ndriver 11 []\n");
    driver->replies[11] = {{.code = platform::simulated::io_failure}};
    expect("enable", "", kr_report(file::kernel_profiler, io_text));
    remove_driver();
    host.before_call(1, [] { std::raise(SIGINT); });
    expect("stop", "", no_driver_report + library_report(file::kernel_profiler, "success"));
}

}  // namespace tests
