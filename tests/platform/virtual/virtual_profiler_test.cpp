// The virtual profiler as the tool sees it: methods, requests, and the stream.

#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/profiler.h"
#include "tests/platform/queue_host.h"

namespace tests {

using namespace std::chrono_literals;
using platform::simulated::component_config;
using platform::simulated::get_u32;

namespace {

// A record of the stream as a test looks at it.
struct event {
    unsigned type, number, category;
    std::uint32_t sequence;
    std::uint64_t time;
};

event read_event(const byte_list& bytes) {
    return {bytes.at(0), bytes.at(1), bytes.at(3), get_u32(bytes, 4),
            get_u32(bytes, 8) + (std::uint64_t{get_u32(bytes, 12)} << 32)};
}

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

    using number_list = std::vector<std::uint64_t>;
    struct reply {
        platform::return_code code;
        byte_list bytes;
    };
    static reply call(const platform::connection& on, std::uint32_t selector,
                      const number_list& scalars, const byte_list& structure = {},
                      std::size_t room = 0) {
        byte_list buffer(room);
        platform::call_outputs outputs{{}, buffer};
        const auto code = platform::call(on, selector, {scalars, structure}, outputs);
        buffer.resize(code == platform::success ? outputs.structure.size() : 0);
        return {code, buffer};
    }
    void enable(bool on) { EXPECT_EQ(call(kernel, 0, {on ? 1U : 0U}).code, platform::success); }
    // What the halves answer to configurations.
    platform::return_code configure_kernel(const std::vector<component_config>& all) {
        return call(kernel, 2, {}, configs(all)).code;
    }
    platform::return_code configure_coprocessor(const std::vector<component_config>& all) {
        return call(coprocessor, 3, {0x24}, configs(all)).code;
    }
    // What is enabled in them.
    byte_list of_kernel(std::size_t room = 1040) { return call(kernel, 3, {}, {}, room).bytes; }
    byte_list of_coprocessor() { return call(coprocessor, 2, {0xd0}, {}, 1040).bytes; }
    void set_duration(std::uint16_t microseconds) {
        const byte_list report{static_cast<std::uint8_t>(microseconds),
                               static_cast<std::uint8_t>(microseconds >> 8), 0, 0};
        EXPECT_EQ(call(coprocessor, 1, {0xd2}, report).code, platform::success);
    }

    // Waits if there is nothing, then takes what stands in the queue.
    std::vector<event> receive() {
        std::vector<event> events;
        if (platform::wait_for_data(queue, port) != platform::success) return events;
        while (platform::data_available(queue)) {
            const byte_list bytes = take(48, platform::success);
            EXPECT_EQ(bytes.size(), 48U);
            events.push_back(read_event(bytes));
        }
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
    EXPECT_EQ(configure_kernel({accel, gyro}), platform::success);
    EXPECT_EQ(of_kernel(), configs({accel, gyro}));
    EXPECT_EQ(of_kernel(103), configs({accel}));
    EXPECT_EQ(of_coprocessor(), byte_list());
    EXPECT_EQ(configure_coprocessor({accel, gyro, change, off}), platform::success);
    EXPECT_EQ(of_coprocessor(), configs({change}));
    const component_config stop{.profiler = 2, .state = component_config::stop};
    EXPECT_EQ(configure_kernel({enabled(0, 2), stop}), platform::success);
    EXPECT_EQ(of_kernel(), configs({enabled(0, 2)}));
    EXPECT_EQ(call(coprocessor, 3, {0x21}).code, platform::success);
    EXPECT_EQ(of_coprocessor(), byte_list());
}

TEST_F(virtual_profiler, refuses_what_a_driver_would_refuse_and_does_the_rest) {
    const std::vector<component_config> all{enabled(6, 1), enabled(7, 0), enabled(2, 7),
                                            enabled(10, 0)};
    EXPECT_EQ(configure_kernel(all), platform::unsupported);
    EXPECT_EQ(of_kernel(), configs({enabled(10, 0)}));
    EXPECT_EQ(configure_coprocessor(all), platform::unsupported);
    EXPECT_EQ(of_coprocessor(), configs({enabled(6, 1), enabled(10, 0)}));
    EXPECT_EQ(call(kernel, 0, {2}).code, platform::bad_argument);
    EXPECT_EQ(call(coprocessor, 3, {0x20}, {0, 0, 0, 0}).code, platform::bad_argument);
    EXPECT_EQ(call(coprocessor, 1, {0xd5}, {2, 0, 0, 0}).code, platform::bad_argument);
}

TEST_F(virtual_profiler, stream_comes_at_its_rate_in_batches_with_coherent_numbers_and_times) {
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
    enable(false);
    expect_no_end_of_waiting();
}

TEST_F(virtual_profiler, stream_ends_when_asked_and_begins_anew_once_the_queue_is_let_go) {
    configure_coprocessor({enabled(0, 0)});
    enable(true);
    receive();
    host.clock().pass(host.clock().now() + 5ms);
    EXPECT_EQ(call(kernel, 11, {}).code, platform::success);
    EXPECT_EQ(call(kernel, 11, {}).code, platform::success);
    const auto events = receive();
    ASSERT_EQ(events.size(), 6U);
    EXPECT_EQ(events[4].time, 25000U);
    EXPECT_EQ(events[5].type, 0U);
    expect_no_end_of_waiting();
    queue.reset();
    ASSERT_EQ(platform::map_memory(kernel, 0, queue), platform::success);
    EXPECT_EQ(receive().size(), 20U);
}

TEST_F(virtual_profiler, duration_report_ends_the_stream_to_the_microsecond_unless_it_is_none) {
    set_duration(50'000);
    set_duration(0);
    expect_no_end_of_waiting();
    configure_coprocessor({enabled(0, 0)});
    enable(true);
    set_duration(50'000);
    EXPECT_EQ(receive().size(), 20U);
    EXPECT_EQ(receive().size(), 20U);
    const auto last = receive();
    EXPECT_EQ(host.clock().now(), 50ms);
    ASSERT_EQ(last.size(), 11U);
    EXPECT_EQ(last.back().type, 0U);
}

TEST_F(virtual_profiler, flush_hands_over_what_has_happened_before_the_batch_is_due) {
    configure_coprocessor({enabled(0, 0)});
    enable(true);
    host.clock().pass(7ms);
    EXPECT_FALSE(platform::data_available(queue));
    EXPECT_EQ(call(coprocessor, 3, {0x23}).code, platform::success);
    EXPECT_EQ(receive().size(), 7U);
    // A full queue loses the oldest.
    host.clock().pass(3600s);
    const auto events = receive();
    EXPECT_EQ(events.size(), platform::simulated::event_stream::capacity);
    EXPECT_EQ(events.back().time, 3'600'000'000U);
}

TEST_F(virtual_profiler, logs_and_dump_hold_what_was_done_and_are_emptied_by_reading) {
    const auto coprocessor_log = [&] { return call(coprocessor, 2, {0xd1}, {}, 65536).bytes; };
    const auto error_dump = [&] { return call(kernel, 8, {}, {}, 48000).bytes.size(); };
    coprocessor_log();
    configure_coprocessor({enabled(0, 0)});
    set_duration(9000);
    set_duration(0);
    enable(true);
    const byte_list notes = coprocessor_log();
    ASSERT_EQ(notes.size(), 3U * 48U);
    EXPECT_EQ(get_u32(notes, 48 + 16), 9000U);
    EXPECT_TRUE(coprocessor_log().empty());
    // Room for one record of those that the start and the enabling have left.
    EXPECT_EQ(call(kernel, 9, {}, {}, 95).bytes.size(), 48U);
    receive();
    receive();
    EXPECT_EQ(error_dump(), 0U);
    EXPECT_EQ(call(kernel, 10, {}).code, platform::success);
    EXPECT_EQ(error_dump(), 33U * 48U);
    EXPECT_EQ(error_dump(), 0U);
}

TEST_F(virtual_profiler, statistics_move_and_can_be_cleared) {
    const auto count = [&] {
        return get_u32(call(coprocessor, 3, {0x20}, {0, 0, 0, 0, 1, 0, 0, 0}, 12800).bytes, 48);
    };
    EXPECT_EQ(count(), 0U);
    host.clock().pass(60s);
    EXPECT_EQ(count(), 1200U);
    EXPECT_EQ(call(coprocessor, 3, {0x20}, byte_list(8)).code, platform::success);
    EXPECT_EQ(count(), 0U);
}

}  // namespace tests
