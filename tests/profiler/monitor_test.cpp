#include "nrxctl/profiler/monitor.h"

#include <csignal>
#include <tuple>

#include "nrxctl/decoders/profile_hexdump.h"
#include "nrxctl/profiler/interrupt_stop.h"
#include "tests/profiler/profiler_host.h"
#include "tests/support/word_vector.h"

namespace tests {

using namespace std::chrono_literals;

namespace {

const byte_list marker = record_bytes(0, 0);

// Whether the stream came to its end, and what was written.
using run = std::tuple<bool, std::string, std::string>;

// A run to the end: the records, then the coprocessor's log.
run ended(const std::string& records, const std::string& reports = "") {
    return {true, records + dumped(8, 0x77) + "done\n", reports};
}

}  // namespace

class monitor : public profiler_test {
protected:
    void SetUp() override {
        profiler_test::SetUp();
        put_both_halves();
        service->set_report_source(0xd1, [this](std::size_t, byte_list& reply) {
            if (!std::exchange(log_read_, true)) reply = record_bytes(8, 0x77);
            return platform::success;
        });
    }

    // Adds an entry to the queue at a time.
    void arrive(std::chrono::milliseconds at, const byte_list& entry) {
        host.clock().plan(at, [this, entry] { driver->queue->add(entry); });
    }

    run watch(std::uint32_t duration = 0) {
        log_read_ = false;
        bool has_ended = false;
        const outcome written = capture([&] {
            const nrx::interrupt_stop stop_while_running;
            has_ended = nrx::monitor_profiler(duration, nrx::dump_profile_record);
        });
        return {has_ended, written.out, written.err};
    }

private:
    bool log_read_ = false;
};

TEST(monitor_words, give_duration_and_human_flag_and_are_announced) {
    for (const auto& [words, duration, human, taken, line] :
         rows<std::string, std::uint32_t, bool, int, std::string>{
             {"", 0, false, 0, "0 us mode=auto (humanReadable=disabled)\n"},
             {"human", 0, true, 1, "0 us mode=auto (humanReadable=enabled)\n"},
             {"human 250 x", 250000, true, 2, "250000 us mode=enable (humanReadable=enabled)\n"},
             {"auto human", 0, false, 1, "0 us mode=auto (humanReadable=disabled)\n"},
             {"0x10", 16000, false, 1, "16000 us mode=enable (humanReadable=disabled)\n"},
             {"0", 0, false, 1, "0 us mode=auto (humanReadable=disabled)\n"},
             {"4294967", 4294967000, false, 1, "-296 us mode=enable (humanReadable=disabled)\n"},
         }) {
        const word_vector all(split(words));
        int index = 0;
        nrx::argument_words left(all.all(), index);
        nrx::monitor_args args;
        EXPECT_EQ(capture([&] { args = nrx::parse_monitor_args(left); }).out, "duration=" + line);
        EXPECT_EQ(std::tuple(args.duration, args.human, index), std::tuple(duration, human, taken))
            << line;
    }
    for (const std::string word : {"", "human", "Auto", "-1", "4294968", "1s"}) {
        const outcome refused = capture([&] { nrx::parse_duration(word); });
        EXPECT_EQ(refused.out, "duration parameter is invalid (" + word + ")\n");
        EXPECT_EQ(refused.status, 1);
    }
}

TEST_F(monitor, stream_is_printed_as_it_comes_until_the_end_marker) {
    driver->queue->add(record_bytes(3, 1));
    arrive(10ms, record_bytes(3, 2));
    arrive(10ms, record_bytes(3, 3));
    arrive(20ms, marker);
    EXPECT_EQ(watch(), ended(dumped(3, 1) + dumped(3, 2) + dumped(3, 3)));
    EXPECT_EQ(host.clock().now(), 120ms);
    const std::string is_there = "data available KeltoNRXProfileDriver";
    const std::string take = "dequeue KeltoNRXProfileDriver room 48";
    const std::string wait = "wait KeltoNRXProfileDriver";
    const std::string read_log = "call profile 2 scalars [0xd1] in [] results 0 room 65536";
    EXPECT_EQ(happened(), (lines{"open KeltoNRXProfileDriver type 0",
                                 "map KeltoNRXProfileDriver memory 0",
                                 "allocate port",
                                 "attach port to KeltoNRXProfileDriver notification 0 reference 0",
                                 "open profile type 0",
                                 "call profile 1 scalars [0xd2] in [00 00 00 00] results 0 room 0",
                                 "close profile",
                                 is_there,
                                 take,
                                 is_there,
                                 wait,
                                 is_there,
                                 take,
                                 is_there,
                                 wait,
                                 is_there,
                                 take,
                                 is_there,
                                 wait,
                                 is_there,
                                 take,
                                 "sleep 100000 us",
                                 is_there,
                                 "open profile type 0",
                                 read_log,
                                 "close profile",
                                 "open profile type 0",
                                 read_log,
                                 "close profile",
                                 "unmap KeltoNRXProfileDriver",
                                 "close KeltoNRXProfileDriver"}));
}

TEST_F(monitor, end_marker_in_every_position_lets_the_last_drain_pick_up_what_follows_it) {
    for (std::size_t position = 0; position <= 3; ++position) {
        std::string printed;
        for (std::uint8_t i = 0; i <= 3; ++i) {
            driver->queue->add(i == position ? marker : record_bytes(3, i));
            if (i != position) printed += dumped(3, i);
        }
        EXPECT_EQ(watch(), ended(printed)) << position;
    }
}

TEST_F(monitor, second_end_marker_ends_the_last_drain_and_the_grace_lets_records_in) {
    driver->queue->add(marker);
    arrive(90ms, record_bytes(3, 1));
    arrive(95ms, marker);
    arrive(95ms, record_bytes(3, 2));
    EXPECT_EQ(watch(), ended(dumped(3, 1)));
    EXPECT_EQ(driver->queue->size(), 1U);
}

TEST_F(monitor, duration_is_told_to_the_coprocessor_and_ends_the_run_when_data_arrive_after_it) {
    arrive(50ms, record_bytes(3, 1));
    arrive(51ms, record_bytes(3, 2));
    arrive(70ms, record_bytes(3, 3));
    EXPECT_EQ(watch(50'000), ended(dumped(3, 1) + dumped(3, 2) + dumped(3, 3)));
    EXPECT_EQ(host.clock().now(), 151ms);
    EXPECT_EQ(logged("call")[0], "call profile 1 scalars [0xd2] in [50 c3 00 00] results 0 room 0");
}

TEST_F(monitor, starts_only_if_it_can_tell_the_duration_or_there_is_no_coprocessor) {
    service->drop_report(0xd2);
    EXPECT_EQ(watch(), run(false, "",
                           failed(command_file, "kr == 0 ", unsupported_text) +
                               failed(monitor_file, "kr == 0 ", unsupported_text)));
    host.remove("profile");
    driver->queue->add(marker);
    EXPECT_EQ(watch(1000),
              run(true, "done\n",
                  failed(channel_file, "service") +
                      failed("base/profile_records.cpp", "result == 0 ", not_found_text)));
}

TEST_F(monitor, queue_that_fails_ends_it_and_keeps_what_is_printed) {
    driver->queue->add(record_bytes(3, 1));
    driver->queue->add(byte_list(49, 1));
    const std::string no_room =
        failed(monitor_file, "kr == 0 ", "reply larger than the room for it (0xe0000402)");
    EXPECT_EQ(watch(), run(false, dumped(3, 1), no_room + no_room));
    driver->queue->clear();
    host.clock().plan(30ms, [this] { host.remove(driver_name); });
    EXPECT_EQ(watch(), run(false, "", failed(monitor_file, "kr == 0 ", not_found_text)));
}

TEST_F(monitor, short_entries_are_reported_and_read_as_0_beyond_their_end) {
    driver->queue->add({3, 0xff});
    driver->queue->add({});
    const std::string too_short = failed(monitor_file, "length >= 48");
    EXPECT_EQ(watch(),
              ended("prof-event 03ff" + std::string(92, '0') + "\n", too_short + too_short));
}

TEST_F(monitor, interrupt_at_any_platform_call_ends_it_in_good_order) {
    driver->actions[11] = [this] { driver->queue->add(marker); };
    const auto stream_a_record = [&] {
        driver->queue->clear();
        driver->queue->add(record_bytes(3, 1));
        arrive(std::chrono::duration_cast<std::chrono::milliseconds>(host.clock().now()) + 10ms,
               marker);
    };
    stream_a_record();
    const std::size_t calls_before = host.calls_made();
    watch();
    const std::size_t calls = host.calls_made() - calls_before;
    for (std::size_t call = 1; call <= calls; ++call) {
        stream_a_record();
        const auto before = times(end_stream_call);
        host.before_call(call, [] { std::raise(SIGINT); });
        EXPECT_EQ(watch(), ended(dumped(3, 1))) << call;
        EXPECT_EQ(times(end_stream_call), before + 1) << call;
    }
}

TEST_F(monitor, interrupt_that_the_driver_refuses_is_reported_and_the_monitor_goes_on) {
    driver->answers[11] = {{.code = platform::simulated::io_failure}};
    host.clock().plan(10ms, [] { std::raise(SIGINT); });
    arrive(20ms, marker);
    EXPECT_EQ(watch(), ended("", failed(kernel_file, "kr == 0 ", io_text)));
}

}  // namespace tests
