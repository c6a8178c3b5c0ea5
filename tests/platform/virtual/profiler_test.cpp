// The stream of the virtual profiler.

#include "platform/virtual/profiler/profiler.h"

#include "platform/virtual/little_endian.h"
#include "tests/platform/platform_test.h"

namespace tests {

using namespace platform;
using namespace std::chrono_literals;
using simulated::component_config;
using simulated::load_u32;

namespace {

// The header of a record.
struct event {
    explicit event(byte_view record)
        : type(record[0]),
          category(record[3]),
          sequence(load_u32(record, 4)),
          time(load_u32(record, 8)) {}

    std::uint32_t type, category, sequence, time;
};

byte_list configs(const std::vector<component_config>& all) {
    return simulated::write_configs(all, all.size() * component_config::record_size);
}

component_config enabled(std::uint32_t category, std::uint32_t component,
                         std::uint32_t reports = 0xffffffff) {
    return {.profiler = category, .component = component, .reports = reports};
}

class virtual_profiler : public device_test {
protected:
    virtual_profiler() { stream.set_rate(1000); }

    // Waits until the stream has events and removes all of them.
    std::vector<event> receive() {
        stream.catch_up();
        if (stream.empty()) clock.advance(stream.next_due());
        std::vector<event> events;
        for (stream.catch_up(); !stream.empty(); stream.pop_front())
            events.emplace_back(stream.front());
        return events;
    }

    simulated::machine_clock& clock = host.clock();
    simulated::profiler profiler{clock};
    simulated::event_stream& stream = *profiler.stream();
};

TEST_F(virtual_profiler, stream_delivers_batches_until_the_queue_is_full) {
    profiler.configure_coprocessor(configs({enabled(2, 5, 0x10000), enabled(4, 0, 2)}));
    profiler.set_enabled(true);
    receive();
    const auto events = receive();
    EXPECT_EQ(clock.now(), 40ms);
    ASSERT_EQ(events.size(), 20U);
    for (std::uint32_t i = 0; i < 20; ++i) {
        EXPECT_EQ(events[i].category, i % 2 == 0 ? 2U : 4U);
        EXPECT_EQ(events[i].time, 20000U + (i + 1) * 1000U);
        EXPECT_EQ(events[i].sequence, events[0].sequence + i);
    }
    clock.advance(47ms);
    stream.catch_up();
    EXPECT_TRUE(stream.empty()) << "only complete batches";
    profiler.flush();
    EXPECT_EQ(stream.size(), 7U);
    clock.advance(3600s);
    stream.catch_up();
    clock.advance(7200s);
    EXPECT_EQ(receive().size(), simulated::event_stream::capacity);
    profiler.set_enabled(false);
    EXPECT_FALSE(stream.next_due());
}

TEST_F(virtual_profiler, stream_ends_once_on_request_or_after_a_duration) {
    profiler.configure_coprocessor(configs({enabled(0, 0)}));
    profiler.set_enabled(true);
    clock.advance(25ms);
    profiler.stop_stream();
    profiler.stop_stream();
    auto events = receive();
    ASSERT_EQ(events.size(), 26U);
    EXPECT_EQ(events[24].time, 25000U);
    EXPECT_EQ(events[25].type, 0U);
    EXPECT_FALSE(stream.next_due());
    stream.on_unmapped();
    profiler.set_duration(1us);
    profiler.set_duration(0us);
    EXPECT_EQ(receive().size(), 20U) << "a duration of 0 cancels the end";
    profiler.set_duration(10ms);
    events = receive();
    EXPECT_EQ(clock.now(), 55ms);
    ASSERT_EQ(events.size(), 11U);
    EXPECT_EQ(events.back().type, 0U);
}

}  // namespace

}  // namespace tests
