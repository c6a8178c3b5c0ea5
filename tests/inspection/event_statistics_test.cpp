#include "nrxctl/inspection/event_statistics.h"

#include "tests/inspection/sensor_host.h"

namespace tests {

using event_statistics = sensor_test;

outcome walk() {
    return capture([] { nrx::print_event_statistics("accel"); });
}

TEST_F(event_statistics, releases_each_entry_as_soon_as_it_holds_the_next) {
    put_whole_sensor(host, "accel");
    walk();
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
    for (const char* missing : {"accel", "first", "second", "third", "fourth"}) {
        put_whole_sensor(host, "accel");
        host.remove(missing);
        const outcome result = walk();
        EXPECT_EQ(result.out, "") << missing;
        EXPECT_EQ(result.err, failure_line("nrxtoollib", host.find("accel") ? "child" : "service",
                                           "nrxctl/inspection/event_statistics.cpp"))
            << missing;
        host.remove("accel");
    }
}

TEST_F(event_statistics, show_a_missing_count_as_minus_1_and_a_missing_time_as_0) {
    struct missing_row {
        const char* entry;
        const char* key;
        std::string text;
        std::string changed;
    };
    for (const auto& [entry, key, text, changed] :
         {missing_row{"third", "_num_events", " 77 ", " -1 "},
          missing_row{"fourth", "EnqueueEventCount", "enqueued=75", "enqueued=-1"},
          missing_row{"fourth", "DroppedEventCount", "dropped=2", "dropped=-1"},
          missing_row{"fourth", "LastEventTime", "1.500000", "0.000000"},
          missing_row{"fourth", "LastDroppedEventTime", "62.000001", "0.000000"}}) {
        put_whole_sensor(host, "accel");
        platform::dictionary& properties = host.find(entry)->properties;
        platform::dictionary rest;
        for (const auto& one : properties.find("DebugState")->entries()->entries())
            if (one.key != key) rest.set(one.key, one.value);
        properties.set("DebugState", rest);
        std::string expected = event_line;
        expected.replace(expected.find(text), text.size(), changed);
        EXPECT_EQ(walk().out, expected);
        host.remove("accel");
    }
}

TEST_F(event_statistics, take_what_is_no_dictionary_or_no_number_for_missing) {
    put_whole_sensor(host, "accel");
    const std::string all_missing =
        "APEvents    : -1 [enqueued=-1 dropped=-1; event_delta=0.000000 dropped_delta=0.000000]\n";
    host.find("third")->properties.set("DebugState", 5);
    host.find("fourth")->properties.set("DebugState",
                                        platform::dictionary{{"EnqueueEventCount", "75"}});
    EXPECT_EQ(walk().out, all_missing);
    host.find("third")->properties = {};
    host.find("fourth")->properties = {};
    const outcome bare = walk();
    EXPECT_EQ(bare.out, all_missing);
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
