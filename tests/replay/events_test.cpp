// The events themselves: their classes, their records byte for byte.
#include "nrxctl/replay/make_event.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

nrx::sample_values values_of(const std::vector<std::pair<const char*, const char*>>& pairs) {
    nrx::sample_values values;
    for (const auto& [key, value] : pairs)
        values.set(key, value);
    return values;
}

byte_list record_of(const nrx::VirtualEvent& event) {
    return {event.data(), event.data() + event.size()};
}

const nrx::sample_values axis_values = values_of({{"sampleid", "0x04030201"},
                                                  {"temperature", "-100"},
                                                  {"x", "0x14131211"},
                                                  {"y", "-2"},
                                                  {"z", "0x34333231"},
                                                  {"timestamp", "0x44434241"}});

}  // namespace

TEST(replay_events, are_made_by_their_exact_tag) {
    for (const std::string tag : {"accel", "gyro", "compass", "pressure"}) {
        const auto event = nrx::make_event(tag);
        ASSERT_TRUE(event) << tag;
        EXPECT_EQ(event->name(), tag);
        EXPECT_EQ(event->size(), tag == "pressure" ? 20U : 28U);
        EXPECT_EQ(event->timestamp(), 0U);
    }
    for (const char* tag : {"", "Accel", "accel ", "acce", "accelx", "als", "compass\n"})
        EXPECT_FALSE(nrx::make_event(tag)) << tag;
}

TEST(replay_events, axis_records_are_seven_words) {
    for (const char* tag : {"accel", "gyro", "compass"}) {
        const auto event = nrx::make_event(tag);
        EXPECT_TRUE(event->parse(axis_values));
        byte_list expected{28,   0,    0,    0,    0,    0,    0,    0,    1,    2,
                           3,    4,    0,    0,    0xff, 0xff, 0x11, 0x12, 0x13, 0x14,
                           0xfe, 0xff, 0xff, 0xff, 0x31, 0x32, 0x33, 0x34};
        EXPECT_EQ(record_of(*event), expected) << tag;
        EXPECT_EQ(event->timestamp(), 0x44434241U);
        event->set_delta(0xd4d3d2d1);
        const byte_list delta{0xd1, 0xd2, 0xd3, 0xd4};
        std::copy(delta.begin(), delta.end(), expected.begin() + 4);
        EXPECT_EQ(record_of(*event), expected) << tag;
    }
}

TEST(replay_events, pressure_records_are_five_words) {
    const auto event = nrx::make_event("pressure");
    EXPECT_TRUE(event->parse(values_of({{"sampleid", "0x04030201"},
                                        {"temperature", "100"},
                                        {"p", "0x14131211"},
                                        {"timestamp", "-2"}})));
    event->set_delta(0xd4d3d2d1);
    EXPECT_EQ(record_of(*event), (byte_list{20, 0, 0, 0, 0xd1, 0xd2, 0xd3, 0xd4, 1,    2,
                                            3,  4, 0, 0, 1,    0,    0x11, 0x12, 0x13, 0x14}));
    EXPECT_EQ(event->timestamp(), 0xfffffffffffffffeU);
}

TEST(replay_events, values_are_kept_by_key_until_cleared) {
    nrx::sample_values values = axis_values;
    values.set("y", "3");
    values.set("nobody", "4");
    EXPECT_EQ(values[nrx::sample_key::y], "3");
    EXPECT_EQ(values[nrx::sample_key::p], "");
    values.clear();
    EXPECT_EQ(values[nrx::sample_key::sampleid], "");
}

}  // namespace tests
