// The virtual profiler: its configuration, its stream, its logs and its statistics.

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

TEST_F(virtual_profiler, each_half_enables_what_it_supports) {
    const byte_list all = configs({enabled(6, 1), enabled(7, 0), enabled(2, 7), enabled(10, 0)});
    EXPECT_EQ(profiler.configure_kernel(configs({enabled(2, 0), enabled(2, 1)})), success);
    EXPECT_EQ(profiler.kernel_configs(103), configs({enabled(2, 0)})) << "only complete records";
    profiler.configure_kernel(configs({{.profiler = 2, .state = component_config::stop}}));
    EXPECT_EQ(profiler.configure_kernel(all), unsupported);
    EXPECT_EQ(profiler.kernel_configs(1040), configs({enabled(10, 0)}));
    EXPECT_EQ(profiler.configure_coprocessor(all), unsupported);
    EXPECT_EQ(profiler.coprocessor_configs(1040), configs({enabled(6, 1), enabled(10, 0)}));
    profiler.configure_coprocessor(
        configs({enabled(6, 1, 1), {.profiler = 10, .state = component_config::disable}}));
    EXPECT_EQ(profiler.coprocessor_configs(1040), configs({enabled(6, 1, 1)}));
    profiler.stop_coprocessor();
    EXPECT_EQ(profiler.coprocessor_configs(1040), byte_list());
}

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

TEST_F(virtual_profiler, logs_and_error_dump_are_emptied_by_reading) {
    for (const std::size_t size : {48U, 0U}) {
        EXPECT_EQ(profiler.read_kernel_log(95).size(), size);
        EXPECT_EQ(profiler.read_coprocessor_log(65536).size(), size);
        EXPECT_TRUE(profiler.read_error_dump(48000).empty());
    }
    profiler.configure_coprocessor(configs({enabled(0, 0)}));
    profiler.set_enabled(true);
    clock.advance(40ms);
    profiler.dump_errors();
    const byte_list dump = profiler.read_error_dump(48000);
    ASSERT_EQ(dump.size(), 33U * 48U);
    EXPECT_EQ(event(byte_view(dump).last(96)).time, 40000U);
    EXPECT_EQ(event(byte_view(dump).last(48)).category, 8U);
}

TEST_F(virtual_profiler, statistics_grow_and_requests_are_checked) {
    const auto shared = add_profiler_driver(host);
    interface_driver& coprocessor = add_service(host, "profile", 1);
    serve_profile(coprocessor, shared);
    clock.advance(60s);
    EXPECT_EQ(load_u32(shared->statistics().event_sources(), 48), 1200U);
    EXPECT_EQ(load_u32(shared->statistics().wake_requests(), 4), 15U);
    for (const method_call& row : {method_call{success, 3, {0x20}, byte_list(8)},
                                   {bad_argument, 3, {0x20}, byte_list(4)},
                                   {unsupported, 3, {0x20}, {1, 0, 0, 0, 0, 0, 0, 0}},
                                   {bad_argument, 1, {0xd2}, {1, 0, 0}},
                                   {bad_argument, 1, {0xd5}, {2, 0, 0, 0}}})
        reply(coprocessor, row);
    reply(*host.find("KeltoNRXProfileDriver")->driver, {bad_argument, 0, {2}});
    EXPECT_EQ(load_u32(shared->statistics().event_sources(), 48), 0U) << "cleared";
    EXPECT_EQ(load_u32(shared->statistics().wake_requests(), 4), 15U);
}

}  // namespace

}  // namespace tests
