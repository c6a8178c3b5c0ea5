// The virtual profiler as the tool sees it: methods, requests, and the stream.

#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/profiler.h"
#include "platform/virtual/return_codes.h"
#include "tests/platform/queue_host.h"

namespace tests {

using namespace std::chrono_literals;
using platform::return_code;
using platform::success;
using platform::simulated::component_config;
using platform::simulated::get_u32;

namespace {

// A record of the stream as a test looks at it.
struct event {
    explicit event(const byte_list& bytes)
        : type(bytes.at(0)),
          number(bytes.at(1)),
          category(bytes.at(3)),
          sequence(get_u32(bytes, 4)),
          time(get_u32(bytes, 8) + (std::uint64_t{get_u32(bytes, 12)} << 32)) {}

    unsigned type, number, category;
    std::uint32_t sequence;
    std::uint64_t time;
};

byte_list configs(const std::vector<component_config>& all) {
    return platform::simulated::write_configs(all, all.size() * component_config::record_size);
}

component_config enabled(std::uint32_t category, std::uint32_t component,
                         std::uint32_t reports = 0xffffffff) {
    return {.profiler = category, .component = component, .reports = reports};
}

}  // namespace

class virtual_profiler : public queue_test {
protected:
    virtual_profiler() {
        const auto shared = add_profiler_driver(host);
        serve_profile(put_service(host, "profile", 1), shared);
        shared->stream()->set_rate(1000);
        connect("KeltoNRXProfileDriver", 0, 0);
        platform::open(service_named("profile"), 0, coprocessor);
    }

    static byte_list call(const platform::connection& on, std::uint32_t selector,
                          const std::vector<std::uint64_t>& scalars,
                          const byte_list& structure = {}, std::size_t room = 0,
                          return_code expected = success) {
        byte_list buffer(room);
        platform::call_outputs outputs{{}, buffer};
        EXPECT_EQ(platform::call(on, selector, {scalars, structure}, outputs), expected);
        return {outputs.structure.begin(), outputs.structure.end()};
    }
    void enable(bool on) { call(kernel, 0, {on ? 1U : 0U}); }
    void configure_kernel(const std::vector<component_config>& all,
                          return_code expected = success) {
        call(kernel, 2, {}, configs(all), 0, expected);
    }
    void configure_coprocessor(const std::vector<component_config>& all,
                               return_code expected = success) {
        call(coprocessor, 3, {0x24}, configs(all), 0, expected);
    }
    // What is enabled in them.
    byte_list of_kernel(std::size_t room = 1040) { return call(kernel, 3, {}, {}, room); }
    byte_list of_coprocessor() { return call(coprocessor, 2, {0xd0}, {}, 1040); }
    void set_duration(std::uint8_t low, std::uint8_t high) {
        call(coprocessor, 1, {0xd2}, {low, high, 0, 0});
    }

    // Waits if there is nothing, then takes what stands in the queue.
    std::vector<event> receive() {
        std::vector<event> events;
        if (platform::wait_for_data(queue, port) != success) return events;
        while (platform::data_available(queue))
            events.emplace_back(take(48, success));
        return events;
    }
    void expect_no_end_of_waiting() {
        EXPECT_EQ(platform::wait_for_data(queue, port), platform::simulated::endless_wait);
    }

    platform::connection& kernel = connection;
    platform::connection coprocessor;
};

TEST_F(virtual_profiler, each_half_keeps_and_returns_what_it_was_configured_to) {
    const auto accel = enabled(2, 0, 4);
    const auto gyro = enabled(2, 1);
    const auto change = enabled(2, 1, 1);
    auto off = accel;
    off.state = component_config::disable;
    configure_kernel({accel, gyro});
    EXPECT_EQ(of_kernel(), configs({accel, gyro}));
    EXPECT_EQ(of_kernel(103), configs({accel}));
    EXPECT_EQ(of_coprocessor(), byte_list());
    configure_coprocessor({accel, gyro, change, off});
    EXPECT_EQ(of_coprocessor(), configs({change}));
    const component_config stop{.profiler = 2, .state = component_config::stop};
    configure_kernel({enabled(0, 2), stop});
    EXPECT_EQ(of_kernel(), configs({enabled(0, 2)}));
    call(coprocessor, 3, {0x21});
    EXPECT_EQ(of_coprocessor(), byte_list());
    // What one does not have is refused, and the rest done.
    const std::vector all{enabled(6, 1), enabled(7, 0), enabled(2, 7), enabled(10, 0)};
    configure_kernel(all, platform::unsupported);
    EXPECT_EQ(of_kernel(), configs({enabled(0, 2), enabled(10, 0)}));
    configure_coprocessor(all, platform::unsupported);
    EXPECT_EQ(of_coprocessor(), configs({enabled(6, 1), enabled(10, 0)}));
}

TEST_F(virtual_profiler, stream_comes_at_its_rate_in_batches_until_the_queue_is_full) {
    configure_coprocessor({enabled(2, 5, 0x10000), enabled(4, 0, 2)});
    enable(true);
    for (unsigned batch = 1; batch <= 3; ++batch) {
        const auto events = receive();
        EXPECT_EQ(host.clock().now(), batch * 20ms);
        ASSERT_EQ(events.size(), 20U);
        for (std::size_t i = 0; i < events.size(); ++i) {
            EXPECT_EQ(events[i].category, i % 2 == 0 ? 2U : 4U);
            EXPECT_EQ(events[i].number, i % 2 == 0 ? 16U : 1U);
            EXPECT_EQ(events[i].time, (batch - 1) * 20000U + (i + 1) * 1000U);
            EXPECT_EQ(events[i].sequence, events[0].sequence + i);
        }
    }
    host.clock().pass(67ms);
    EXPECT_FALSE(platform::data_available(queue));
    call(coprocessor, 3, {0x23});
    EXPECT_EQ(receive().size(), 7U) << "flushed before the batch is due";
    host.clock().pass(3600s);
    EXPECT_EQ(receive().size(), platform::simulated::event_stream::capacity);
    enable(false);
    expect_no_end_of_waiting();
}

TEST_F(virtual_profiler, stream_ends_when_asked_or_after_its_duration_and_begins_anew) {
    configure_coprocessor({enabled(0, 0)});
    enable(true);
    receive();
    host.clock().pass(25ms);
    call(kernel, 11, {});
    call(kernel, 11, {});
    auto events = receive();
    ASSERT_EQ(events.size(), 6U);
    EXPECT_EQ(events[4].time, 25000U);
    EXPECT_EQ(events[5].type, 0U);
    expect_no_end_of_waiting();
    queue.reset();
    ASSERT_EQ(platform::map_memory(kernel, 0, queue), success);
    set_duration(1, 0);
    set_duration(0, 0);
    EXPECT_EQ(receive().size(), 20U) << "a duration of none is none";
    set_duration(0x10, 0x27);
    const auto end = host.clock().now() + 10ms;
    events = receive();
    EXPECT_EQ(host.clock().now(), end);
    ASSERT_EQ(events.size(), 11U);
    EXPECT_EQ(events.back().type, 0U);
}

TEST_F(virtual_profiler, logs_and_dump_hold_what_was_done_and_are_emptied_by_reading) {
    const auto kernel_log = [&] { return call(kernel, 9, {}, {}, 95); };
    const auto coprocessor_log = [&] { return call(coprocessor, 2, {0xd1}, {}, 65536); };
    const auto error_dump = [&] { return call(kernel, 8, {}, {}, 48000); };
    kernel_log();
    coprocessor_log();
    configure_coprocessor({enabled(0, 0)});
    enable(true);
    set_duration(0x10, 0x27);
    const byte_list notes = coprocessor_log();
    ASSERT_EQ(notes.size(), 96U);
    EXPECT_EQ(get_u32(notes, 48 + 16), 10000U);
    EXPECT_TRUE(coprocessor_log().empty());
    enable(false);
    for (const std::size_t size : {48U, 48U, 0U})
        EXPECT_EQ(kernel_log().size(), size);
    EXPECT_TRUE(error_dump().empty());
    set_duration(0, 0);
    enable(true);
    receive();
    receive();
    call(kernel, 10, {});
    const byte_list dump = error_dump();
    ASSERT_EQ(dump.size(), 33U * 48U);
    EXPECT_EQ(event({dump.end() - 96, dump.end() - 48}).time, 40000U);
    EXPECT_EQ(event({dump.end() - 48, dump.end()}).category, 8U);
}

TEST_F(virtual_profiler, statistics_move_and_can_be_cleared_and_other_words_are_refused) {
    const auto count = [&] {
        return get_u32(call(coprocessor, 3, {0x20}, {0, 0, 0, 0, 1, 0, 0, 0}, 12800), 48);
    };
    const auto wakes = [&] {
        return get_u32(call(coprocessor, 3, {0x20}, {10, 0, 0, 0, 0, 0, 0, 0}, 108), 4);
    };
    EXPECT_EQ(count() + wakes(), 0U);
    host.clock().pass(60s);
    EXPECT_EQ(count(), 1200U);
    EXPECT_EQ(wakes(), 15U);
    call(coprocessor, 3, {0x20}, byte_list(8));
    EXPECT_EQ(count(), 0U);
    EXPECT_EQ(wakes(), 15U);
    call(coprocessor, 3, {0x20}, byte_list(4), 0, platform::bad_argument);
    call(coprocessor, 1, {0xd5}, {2, 0, 0, 0}, 0, platform::bad_argument);
    call(kernel, 0, {2}, {}, 0, platform::bad_argument);
}

}  // namespace tests
