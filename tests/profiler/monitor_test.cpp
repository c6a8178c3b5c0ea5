// The monitors of records and of SCM transfers.
#include "nrxctl/profiler/monitor.h"

#include <csignal>

#include "nrxctl/base/output.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/scm_monitor.h"
#include "tests/profiler/profiler_host.h"
#include "tests/support/argument_vector.h"

namespace tests {

using namespace std::chrono_literals;

// A complete run: the records, the coprocessor's log, and failure reports.
result complete(const std::string& records, const std::string& reports = "") {
    return {true, records + dumped(8, 0x77) + "done\n" + reports};
}

struct monitor : profiler_test {
    // Adds an entry to the queue at a time from now.
    void add_in(std::chrono::milliseconds delay, const byte_list& entry) {
        host.clock().run_at(host.clock().now() + delay, [=, this] { driver->queue->add(entry); });
    }

    // Runs a monitor. The coprocessor's log holds one record.
    result watch(std::uint32_t duration = 0) {
        set_fw_log(record_bytes(8, 0x77));
        return attempt([=] {
            const nrx::scoped_interrupt_handler interrupt_handler;
            return nrx::monitor_profiler(duration, nrx::dump_profile_record);
        });
    }
};

TEST(monitor_args, duration_and_human_flag_are_parsed_and_printed) {
    for (const auto& [arguments, count, line] : rows<std::string, int, std::string>{
             {"", 0, "0 us mode=auto (humanReadable=disabled)\n"},
             {"human", 1, "0 us mode=auto (humanReadable=enabled)\n"},
             {"human 250 x", 2, "250000 us mode=enable (humanReadable=enabled)\n"},
             {"auto human", 1, "0 us mode=auto (humanReadable=disabled)\n"},
             {"0x10", 1, "16000 us mode=enable (humanReadable=disabled)\n"},
             {"0", 1, "0 us mode=auto (humanReadable=disabled)\n"},
             {"4294967", 1, "-296 us mode=enable (humanReadable=disabled)\n"}}) {
        const argument_vector command_line(split(arguments));
        int index = 0;
        nrx::argument_cursor cursor(command_line.span(), index);
        EXPECT_EQ(capture([&] { nrx::parse_monitor_args(cursor); }).out, "duration=" + line);
        EXPECT_EQ(index, count) << line;
    }
    for (const std::string duration : {"", "human", "Auto", "-1", "4294968", "1s"}) {
        const outcome refused = capture([&] { nrx::parse_duration(duration); });
        EXPECT_EQ(refused.out, "duration parameter is invalid (" + duration + ")\n");
        EXPECT_EQ(refused.status, 1);
    }
}

TEST_F(monitor, stream_is_printed_until_the_end_marker) {
    driver->queue->add(record_bytes(3, 1));
    add_in(10ms, record_bytes(3, 2));
    add_in(20ms, end_marker);
    EXPECT_EQ(watch(), complete(dumped(3, 1) + dumped(3, 2)));
    EXPECT_EQ(host.clock().now(), 120ms);
    const std::string check = "data available driver\n";
    const std::string dequeue = check + "dequeue driver capacity 48\n";
    const std::string wait = check + "wait driver\n";
    const std::string read_log =
        "open profile type 0\ncall profile 2 [0xd1] capacity 65536\nclose profile\n";
    EXPECT_EQ(new_events(),
              "open driver type 0\nmap driver memory 0\nallocate port\n"
              "attach port to driver notification 0 reference 0\nopen profile type 0\n"
              "call profile 1 [0xd2] in [00 00 00 00]\nclose profile\n" +
                  dequeue + wait + dequeue + wait + dequeue + "sleep 100000 us\n" + check +
                  read_log + read_log + "unmap driver\nclose driver\n");
}

TEST_F(monitor, ends_100_ms_after_the_marker_or_a_record_past_the_duration) {
    const std::string two_records = dumped(3, 1) + dumped(3, 2);
    using schedule = rows<std::chrono::milliseconds, std::uint8_t>;  // delay, fill; 0: end marker
    for (const auto& [entries, duration, printed, time, remaining] :
         rows<schedule, std::uint32_t, std::string, std::chrono::milliseconds, std::size_t>{
             {{{0ms, 0}, {0ms, 1}, {0ms, 2}}, 0, two_records, 100ms, 0},
             {{{0ms, 1}, {0ms, 0}, {0ms, 2}}, 0, two_records, 100ms, 0},
             {{{10ms, 1}, {10ms, 2}, {20ms, 0}}, 0, two_records, 120ms, 0},
             {{{0ms, 0}, {90ms, 1}, {95ms, 0}, {95ms, 2}}, 0, dumped(3, 1), 100ms, 1},
             {{{50ms, 1}, {51ms, 2}, {150ms, 0}}, 50'000, two_records, 151ms, 0}}) {
        driver->queue->clear();
        const auto start = host.clock().now();
        for (const auto& [delay, fill] : entries)
            add_in(delay, fill == 0 ? end_marker : record_bytes(3, fill));
        EXPECT_EQ(watch(duration), complete(printed));
        EXPECT_EQ(host.clock().now() - start, time);
        EXPECT_EQ(driver->queue->size(), remaining);
    }
    EXPECT_TRUE(new_calls().ends_with(
        "profile 1 [0xd2] in [50 c3 00 00]\n"
        "profile 2 [0xd1] capacity 65536\nprofile 2 [0xd1] capacity 65536\n"));
}

TEST_F(monitor, flushes_output_before_each_wait) {
    nrx::memory_sink target;
    const nrx::scoped_sink installed(nrx::standard_stream::output, target);
    const nrx::block_output blocks;
    nrx::print_line("buffered");
    std::vector<std::string> seen;
    for (const auto moment : {5ms, 50ms})
        host.clock().run_at(moment, [&] { seen.push_back(target.text()); });
    add_in(10ms, record_bytes(3, 1));
    add_in(10ms, end_marker);
    nrx::monitor_profiler(0, nrx::dump_profile_record);
    EXPECT_EQ(seen, (std::vector<std::string>{"buffered\n", "buffered\n" + dumped(3, 1)}));
}

TEST_F(monitor, starts_only_if_the_duration_is_accepted) {
    service->drop_report(0xd2);
    EXPECT_EQ(watch(), result(false, kr_report(file::command_channel, unsupported_text) +
                                         kr_report(file::monitor, unsupported_text)));
    remove_service();
    driver->queue->add(end_marker);
    EXPECT_EQ(watch(1000), result(true, "done\n" + library_report(file::channel, "service") +
                                            library_report(file::profile_record, "result == 0 ",
                                                           not_found_text)));
}

TEST_F(monitor, failure_of_the_queue_ends_it) {
    driver->queue->add(record_bytes(3, 1));
    driver->queue->add(byte_list(49, 1));
    const std::string too_long =
        kr_report(file::monitor, "reply larger than the room for it (0xe0000402)");
    EXPECT_EQ(watch(), result(false, dumped(3, 1) + too_long + too_long));
    driver->queue->clear();
    host.clock().run_at(30ms, [this] { remove_driver(); });
    EXPECT_EQ(watch(), result(false, kr_report(file::monitor, not_found_text)));
}

TEST_F(monitor, short_entry_is_reported_and_reads_as_0_beyond_its_end) {
    driver->queue->add({3, 0xff});
    driver->queue->add({});
    const std::string too_short = library_report(file::monitor, "length >= 48");
    EXPECT_EQ(watch(),
              complete("prof-event 03ff" + std::string(92, '0') + "\n", too_short + too_short));
}

TEST_F(monitor, interrupt_at_any_platform_call_ends_it) {
    std::size_t stops = 0;
    driver->actions[11] = [&] {
        ++stops;
        driver->queue->add(end_marker);
    };
    const auto watch_a_record = [&] {
        driver->queue->clear();
        driver->queue->add(record_bytes(3, 1));
        add_in(10ms, end_marker);
        return watch();
    };
    watch_a_record();
    const std::size_t calls = host.calls_made();
    for (std::size_t call = 1; call <= calls; ++call) {
        host.before_call(call, [] { std::raise(SIGINT); });
        EXPECT_EQ(watch_a_record(), complete(dumped(3, 1))) << call;
        EXPECT_EQ(stops, call);
    }
}

using platform::simulated::io_failure;

const std::string status_call = "driver 1 [] results 1\n";
const std::string enable_call = "driver 0 [0x1]\n";
const std::string disable_call = "driver 0 [0x0]\n";
const std::string start_call =
    "profile 3 [0x24] in [09 00 00 00 02 00 00 00 00 00 00 00 80 00 00 00 zeros]\n";
const std::string stop_call =
    "profile 3 [0x24] in [09 00 00 00 00 00 00 00 02 00 00 00 ff ff ff ff zeros]\n";

struct scm_monitor : profiler_test {
    // A transfer on smb1, channel 7, and the end of the stream.
    void add_transfer() {
        driver->queue->add(joined({{3, 7, 2, 9}, u32_report({1, 100, 0, 1, 5000}), byte_list(24)}));
        driver->queue->add(end_marker);
    }

    static outcome watch(const std::string& duration, const std::string& args = "scm:smb1:ch7") {
        const argument_vector command_line(split(args));
        int index = 0;
        return capture([&] { nrx::scm_monitor(duration, command_line.span(), index); });
    }
};

TEST_F(scm_monitor, configures_the_coprocessor_and_prints_transfers) {
    const std::string refused = kr_report(file::kernel_profiler, io_text);
    for (const auto& [is_connected, enabling, reports] :
         rows<bool, platform::return_code, std::string>{{false, platform::success, ""},
                                                        {false, io_failure, refused + refused},
                                                        {true, platform::success, ""}}) {
        driver->replies[0] = {{.code = enabling}};
        driver->replies[1] = {{.scalar = is_connected}};
        add_transfer();
        const outcome written = watch("10");
        EXPECT_EQ(written.out + written.err,
                  "smb1.7: scm_write wqr_timestamp=100 scm_timestamp=5000\ndone\n" + reports);
        const std::string calls = start_call +
                                  "profile 1 [0xd2] in [10 27 00 00]\n"
                                  "profile 2 [0xd1] capacity 65536\n" +
                                  stop_call;
        EXPECT_EQ(new_calls(),
                  status_call + (is_connected ? calls : enable_call + calls + disable_call));
    }
}

TEST_F(scm_monitor, failure_after_enabling_is_reported_and_disables) {
    const std::string report = library_report(file::scm_monitor, "success");
    set_reply(0x24, platform::unsupported);
    const outcome refused = watch("10");
    EXPECT_EQ(refused.out + refused.err, "Can't enable SCM profiler\n" + report);
    EXPECT_EQ(new_calls(), status_call + enable_call + start_call + disable_call);

    service->set_command(0x24, [count = 0](platform::byte_view, byte_list&) mutable {
        return count++ == 0 ? platform::success : io_failure;
    });
    driver->queue = nullptr;
    EXPECT_TRUE(watch("10").err.ends_with(library_report(file::monitor, "success") + report));
    EXPECT_EQ(new_calls(), status_call + enable_call + start_call + stop_call + disable_call);
}

TEST_F(scm_monitor, interrupt_is_handled_until_just_before_it_disables) {
    add_transfer();
    std::map<std::string, bool> handled;  // by call
    for (std::size_t call = 1; call < 100; ++call)
        host.before_call(call, [&] { handled[new_calls()] = !has_default_interrupt_action(); });
    watch("10");
    EXPECT_TRUE(handled.at(enable_call));
    EXPECT_FALSE(handled.at(disable_call));
}

TEST_F(scm_monitor, ends_early_without_profiler_status_or_valid_arguments) {
    const std::string success = library_report(file::scm_monitor, "success");
    driver->replies[1] = {{.code = io_failure}, {}};
    EXPECT_EQ(watch("10", "scm:smb1").err, kr_report(file::kernel_profiler, io_text) + success);
    EXPECT_EQ(watch("10", "").err, library_report(file::scm_monitor, "configs.size() != 0"));
    EXPECT_EQ(watch("auto", "smb1").err, library_report(file::config_parser, "result") + success);
    EXPECT_EQ(watch("human", "scm:smb1").out, "duration parameter is invalid (human)\n");
    EXPECT_EQ(new_calls(), status_call + status_call + status_call + status_call);
    remove_service();
    EXPECT_EQ(watch("10", "scm:smb1").out, "wqr fw profiler is not available\n");
    EXPECT_EQ(new_calls(), "");
}

}  // namespace tests
