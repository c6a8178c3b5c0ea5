#include "nrxctl/inspection/event_statistics.h"

#include "tests/inspection/sensor_host.h"

namespace tests {

using event_statistics = device_test;

outcome walk() {
    return capture([] { nrx::print_event_statistics("accel"); });
}

TEST_F(event_statistics, releases_each_entry_as_soon_as_it_holds_the_next) {
    put_whole_sensor(host, "accel");
    EXPECT_EQ(walk().out,
              "APEvents    : 77 [enqueued=75 dropped=2; event_delta=1.500000 "
              "dropped_delta=62.000001]\n");
    const auto& log = host.log();
    ASSERT_GE(log.size(), 11U);
    EXPECT_EQ(std::vector<std::string>(log.end() - 11, log.end()),
              (std::vector<std::string>{
                  "first child of accel", "release accel", "first child of first", "release first",
                  "first child of second", "release second", "property of third DebugState",
                  "first child of third", "release third", "property of fourth DebugState",
                  "release fourth"}));
}

TEST_F(event_statistics, have_no_line_if_a_level_is_missing) {
    const std::string file = "nrxctl/inspection/event_statistics.cpp";
    const outcome nothing = walk();
    EXPECT_EQ(nothing.out, "");
    EXPECT_EQ(nothing.err, failure_line("nrxtoollib", "service", file));
    for (const char* missing : {"first", "second", "third", "fourth"}) {
        put_whole_sensor(host, "accel");
        host.remove(missing);
        const outcome result = walk();
        EXPECT_EQ(result.out, "") << missing;
        EXPECT_EQ(result.err, failure_line("nrxtoollib", "child", file)) << missing;
        host.remove("accel");
    }
}

TEST_F(event_statistics, show_a_missing_count_as_minus_1_and_a_missing_time_as_0) {
    put_whole_sensor(host, "accel");
    const auto third = host.find("third");
    const auto fourth = host.find("fourth");
    const platform::dictionary events = *third->properties.find("DebugState")->entries();
    const platform::dictionary queue = *fourth->properties.find("DebugState")->entries();
    const auto text_without = [&](const std::string& key) {
        for (const auto& [entry, whole] : {std::pair{third, events}, std::pair{fourth, queue}}) {
            platform::dictionary rest;
            for (const auto& one : whole.entries())
                if (one.key != key) rest.set(one.key, one.value);
            entry->properties.set("DebugState", rest);
        }
        return walk().out;
    };
    const auto line = [](const char* events_and_counts, const char* last, const char* dropped) {
        return std::string("APEvents    : ") + events_and_counts + "; event_delta=" + last +
               " dropped_delta=" + dropped + "]\n";
    };
    EXPECT_EQ(text_without("_num_events"),
              line("-1 [enqueued=75 dropped=2", "1.500000", "62.000001"));
    EXPECT_EQ(text_without("EnqueueEventCount"),
              line("77 [enqueued=-1 dropped=2", "1.500000", "62.000001"));
    EXPECT_EQ(text_without("DroppedEventCount"),
              line("77 [enqueued=75 dropped=-1", "1.500000", "62.000001"));
    EXPECT_EQ(text_without("LastEventTime"),
              line("77 [enqueued=75 dropped=2", "0.000000", "62.000001"));
    EXPECT_EQ(text_without("LastDroppedEventTime"),
              line("77 [enqueued=75 dropped=2", "1.500000", "0.000000"));
    // What is no dictionary, or no number, is as good as missing.
    third->properties.set("DebugState", 5);
    fourth->properties.set("DebugState", platform::dictionary{{"EnqueueEventCount", "75"}});
    EXPECT_EQ(walk().out, line("-1 [enqueued=-1 dropped=-1", "0.000000", "0.000000"));
    third->properties = {};
    fourth->properties = {};
    const outcome bare = walk();
    EXPECT_EQ(bare.out, line("-1 [enqueued=-1 dropped=-1", "0.000000", "0.000000"));
    EXPECT_EQ(bare.err, "");
}

TEST_F(event_statistics, cut_counts_to_32_bits_and_take_times_as_unsigned) {
    put_whole_sensor(host, "accel");
    const platform::dictionary queue{{"EnqueueEventCount", std::int64_t{0x1'8000'0000}},
                                     {"DroppedEventCount", INT32_MAX},
                                     {"LastEventTime", std::int64_t{-1}},
                                     {"LastDroppedEventTime", std::int64_t{499}}};
    host.find("fourth")->properties.set("DebugState", queue);
    EXPECT_EQ(walk().out,
              "APEvents    : 77 [enqueued=-2147483648 dropped=2147483647; "
              "event_delta=18446744073.709553 dropped_delta=0.000000]\n");
}

}  // namespace tests
