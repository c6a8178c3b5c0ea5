// The virtual profiler as the tool sees it: methods, requests, and the stream.

#include <map>
#include <set>

#include "platform/data_queue.h"
#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/profiler.h"
#include "tests/support/device_test.h"

namespace tests {

using namespace std::chrono_literals;
using platform::simulated::component_config;
using platform::simulated::event_stream;
using platform::simulated::profiler;

namespace {

// A record of the stream as a test looks at it.
struct event {
    unsigned type, number, component, category;
    std::uint32_t sequence;
    std::uint64_t time;
    byte_list bytes;
};

event read_event(const byte_list& bytes) {
    using platform::simulated::get_u32;
    return {bytes.at(0),
            bytes.at(1),
            bytes.at(2),
            bytes.at(3),
            get_u32(bytes, 4),
            get_u32(bytes, 8) + (std::uint64_t{get_u32(bytes, 12)} << 32),
            bytes};
}

byte_list configs(const std::vector<component_config>& all) {
    return platform::simulated::write_configs(all, all.size() * component_config::record_size);
}

component_config enabled(std::uint32_t category, std::uint32_t component,
                         std::uint32_t reports = 0xffffffff) {
    return {.profiler = category, .component = component, .reports = reports};
}

}  // namespace

class virtual_profiler : public device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        shared = add_profiler_driver(host);
        serve_profile(put_service(host, "profile", 1), shared);
        shared->stream()->set_rate(1000);
        const auto provider = platform::first_match({{"IONameMatch", "KeltoNRXProfileDriver"}});
        const auto profile = platform::first_match({{"IONameMatch", "profile"}});
        ASSERT_EQ(platform::open(provider, 0, kernel), platform::success);
        ASSERT_EQ(platform::open(profile, 0, coprocessor), platform::success);
        ASSERT_EQ(platform::map_memory(kernel, 0, queue), platform::success);
        port = platform::allocate_port();
        ASSERT_EQ(platform::attach_port(kernel, 0, port, 0), platform::success);
    }
    void TearDown() override {
        queue.reset();
        port.reset();
        kernel.reset();
        coprocessor.reset();
        device_test::TearDown();
    }

    struct reply {
        platform::return_code code;
        byte_list bytes;
        bool operator==(const reply&) const = default;
    };
    static reply call(const platform::connection& on, std::uint32_t selector,
                      const std::vector<std::uint64_t>& scalars, const byte_list& structure,
                      std::size_t room) {
        byte_list buffer(room);
        platform::call_outputs outputs{{}, buffer};
        const auto code = platform::call(on, selector, {scalars, structure}, outputs);
        buffer.resize(code == platform::success ? outputs.structure.size() : 0);
        return {code, buffer};
    }
    platform::return_code enable(bool on) { return call(kernel, 0, {on ? 1U : 0U}, {}, 0).code; }
    platform::return_code configure(const std::vector<component_config>& all) {
        const auto code = call(coprocessor, 3, {0x24}, configs(all), 0).code;
        return code != platform::success ? code : call(kernel, 2, {}, configs(all), 0).code;
    }
    platform::return_code set_duration(std::uint8_t milliseconds) {
        const std::uint32_t microseconds = milliseconds * 1000U;
        return call(coprocessor, 1, {0xd2},
                    {static_cast<std::uint8_t>(microseconds),
                     static_cast<std::uint8_t>(microseconds >> 8), 0, 0},
                    0)
            .code;
    }

    // Waits if there is nothing, then takes what stands in the queue.
    std::vector<event> receive() {
        std::vector<event> events;
        if (platform::wait_for_data(queue, port) != platform::success) return events;
        while (platform::data_available(queue)) {
            byte_list bytes(48);
            platform::byte_span entry = bytes;
            EXPECT_EQ(platform::dequeue(queue, entry), platform::success);
            EXPECT_EQ(entry.size(), 48U);
            events.push_back(read_event(bytes));
        }
        return events;
    }

    std::shared_ptr<profiler> shared;
    platform::connection kernel;
    platform::connection coprocessor;
    platform::mapped_memory queue;
    platform::notification_port port;
};

TEST_F(virtual_profiler, each_half_keeps_and_returns_what_it_was_configured_to) {
    const component_config accel{
        .profiler = 2, .component = 0, .reports = 4, .services = {0x6c6c61}};
    const component_config gyro = enabled(2, 1);
    EXPECT_EQ(call(kernel, 2, {}, configs({accel, gyro}), 0).code, platform::success);
    EXPECT_EQ(call(kernel, 3, {}, {}, 1040), (reply{platform::success, configs({accel, gyro})}));
    EXPECT_EQ(call(kernel, 3, {}, {}, 103), (reply{platform::success, configs({accel})}));
    EXPECT_EQ(call(coprocessor, 2, {0xd0}, {}, 1040), (reply{platform::success, {}}));

    component_config change = gyro;
    change.reports = 1;
    component_config off = accel;
    off.state = component_config::disable;
    EXPECT_EQ(call(coprocessor, 3, {0x24}, configs({accel, gyro, change, off}), 0).code,
              platform::success);
    EXPECT_EQ(call(coprocessor, 2, {0xd0}, {}, 1040),
              (reply{platform::success, configs({change})}));
    const component_config stop{.profiler = 2, .state = component_config::stop};
    EXPECT_EQ(call(kernel, 2, {}, configs({enabled(0, 2), stop}), 0).code, platform::success);
    EXPECT_EQ(call(kernel, 3, {}, {}, 1040), (reply{platform::success, configs({enabled(0, 2)})}));
    EXPECT_EQ(call(coprocessor, 3, {0x21}, {}, 0).code, platform::success);
    EXPECT_EQ(call(coprocessor, 2, {0xd0}, {}, 1040), (reply{platform::success, {}}));
}

TEST_F(virtual_profiler, half_that_cannot_do_one_configuration_does_the_others) {
    const std::vector<component_config> all{enabled(6, 1), enabled(7, 0), enabled(2, 7),
                                            enabled(10, 0)};
    EXPECT_EQ(call(kernel, 2, {}, configs(all), 0).code, platform::unsupported);
    EXPECT_EQ(call(kernel, 3, {}, {}, 1040).bytes, configs({enabled(10, 0)}));
    EXPECT_EQ(call(coprocessor, 3, {0x24}, configs(all), 0).code, platform::unsupported);
    EXPECT_EQ(call(coprocessor, 2, {0xd0}, {}, 1040).bytes,
              configs({enabled(6, 1), enabled(10, 0)}));
    EXPECT_EQ(call(kernel, 2, {}, {}, 0).code, platform::success);
}

TEST_F(virtual_profiler, refuses_what_a_driver_would_refuse) {
    EXPECT_EQ(call(kernel, 4, {}, {}, 0).code, platform::unsupported);
    EXPECT_EQ(call(kernel, 0, {2}, {}, 0).code, platform::bad_argument);
    EXPECT_EQ(call(kernel, 0, {}, {}, 0).code, platform::bad_argument);
    EXPECT_EQ(call(kernel, 11, {}, {1}, 0).code, platform::bad_argument);
    EXPECT_EQ(call(coprocessor, 3, {0x22}, {}, 0).code, platform::unsupported);
    EXPECT_EQ(call(coprocessor, 3, {0x20}, {0, 0, 0, 0}, 0).code, platform::bad_argument);
    EXPECT_EQ(call(coprocessor, 3, {0x20}, {5, 0, 0, 0, 0, 0, 0, 0}, 0).code,
              platform::unsupported);
    EXPECT_EQ(call(coprocessor, 1, {0xd2}, {1}, 0).code, platform::bad_argument);
    EXPECT_EQ(call(coprocessor, 1, {0xd5}, {2, 0, 0, 0}, 0).code, platform::bad_argument);
    EXPECT_EQ(call(coprocessor, 1, {0xd5}, {1, 0, 0, 0}, 0).code, platform::success);
    EXPECT_EQ(call(coprocessor, 2, {0xd5}, {}, 4), (reply{platform::success, {1, 0, 0, 0}}));
}

TEST_F(virtual_profiler, stream_comes_at_its_rate_in_batches_with_coherent_numbers_and_times) {
    ASSERT_EQ(configure({enabled(2, 0, 4), enabled(3, 0, 1)}), platform::success);
    EXPECT_FALSE(platform::data_available(queue));
    ASSERT_EQ(enable(true), platform::success);
    for (unsigned batch = 1; batch <= 3; ++batch) {
        const auto events = receive();
        EXPECT_EQ(host.clock().now(), batch * 20ms);
        ASSERT_EQ(events.size(), 20U);
        for (std::size_t i = 0; i < events.size(); ++i) {
            EXPECT_EQ(events[i].category, i % 2 == 0 ? 2U : 3U);
            EXPECT_EQ(events[i].time, (batch - 1) * 20000U + (i + 1) * 1000U);
            EXPECT_EQ(events[i].sequence, events[0].sequence + i);
        }
    }
    ASSERT_EQ(enable(false), platform::success);
    EXPECT_FALSE(platform::data_available(queue));
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::simulated::endless_wait);
}

TEST_F(virtual_profiler, every_category_and_every_type_is_produced) {
    std::vector<component_config> all;
    for (std::uint32_t component = 0; component < 6; ++component)
        all.push_back(enabled(0, component));
    for (const std::uint32_t category : {1U, 2U, 3U, 4U, 5U, 6U, 9U, 10U})
        all.push_back(enabled(category, 0));
    call(coprocessor, 3, {0x24}, configs(all), 0);
    enable(true);
    std::set<unsigned> categories;
    std::set<unsigned> types;
    for (int batch = 0; batch < 30; ++batch) {
        for (const event& one : receive()) {
            categories.insert(one.category);
            types.insert(one.type);
        }
    }
    EXPECT_EQ(categories, (std::set<unsigned>{0, 1, 2, 3, 4, 5, 6, 9, 10}));
    EXPECT_EQ(types, (std::set<unsigned>{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13}));
}

TEST_F(virtual_profiler, report_masks_choose_the_events) {
    configure({enabled(2, 5, 0x10001), enabled(4, 0, 2), enabled(1, 0, 0x80000000)});
    enable(true);
    std::map<unsigned, std::set<unsigned>> seen;
    for (const event& one : receive())
        seen[one.category].insert(one.number);
    EXPECT_EQ(seen, (std::map<unsigned, std::set<unsigned>>{{2, {0, 16}}, {4, {1}}}));
}

TEST_F(virtual_profiler, transfers_bring_their_data_in_pieces_with_their_time_stamp) {
    configure({enabled(9, 3, 0x20)});
    enable(true);
    bool in_pieces = false;
    std::uint64_t transfer = 0;
    unsigned expected_offset = 0;
    for (const event& one : receive()) {
        EXPECT_EQ(one.component, 3U);
        EXPECT_EQ(one.number, 5U);
        if (one.type == 3) {
            EXPECT_LE(one.bytes[16], 1U);
            transfer = one.time;
            expected_offset = 0;
            continue;
        }
        ASSERT_EQ(one.type, 1U);
        EXPECT_EQ(one.time, transfer);
        EXPECT_EQ(one.bytes[22], expected_offset);
        EXPECT_LE(one.bytes[22] + one.bytes[20], one.bytes[18]);
        in_pieces |= expected_offset > 0;
        expected_offset += one.bytes[20];
    }
    EXPECT_TRUE(in_pieces);
}

TEST_F(virtual_profiler, stream_ends_when_asked_and_begins_anew_once_the_queue_is_let_go) {
    configure({enabled(0, 0)});
    enable(true);
    receive();
    host.clock().pass(host.clock().now() + 5ms);
    EXPECT_EQ(call(kernel, 11, {}, {}, 0).code, platform::success);
    EXPECT_EQ(call(kernel, 11, {}, {}, 0).code, platform::success);
    const auto events = receive();
    ASSERT_EQ(events.size(), 6U);
    EXPECT_EQ(events[4].time, 25000U);
    EXPECT_EQ(events[5].bytes, byte_list(48, 0));
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::simulated::endless_wait);
    queue.reset();
    ASSERT_EQ(platform::map_memory(kernel, 0, queue), platform::success);
    EXPECT_EQ(receive().size(), 20U);
}

TEST_F(virtual_profiler, duration_report_ends_the_stream_to_the_microsecond) {
    configure({enabled(0, 0)});
    enable(true);
    EXPECT_EQ(set_duration(50), platform::success);
    EXPECT_EQ(receive().size(), 20U);
    EXPECT_EQ(receive().size(), 20U);
    const auto last = receive();
    EXPECT_EQ(host.clock().now(), 50ms);
    ASSERT_EQ(last.size(), 11U);
    EXPECT_EQ(last.back().type, 0U);
    EXPECT_EQ(call(coprocessor, 2, {0xd2}, {}, 4).bytes, (byte_list{0x50, 0xc3, 0, 0}));
}

TEST_F(virtual_profiler, duration_of_none_calls_an_earlier_one_off) {
    EXPECT_EQ(set_duration(50), platform::success);
    EXPECT_EQ(set_duration(0), platform::success);
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::simulated::endless_wait);
}

TEST_F(virtual_profiler, flush_hands_over_what_has_happened_before_the_batch_is_due) {
    configure({enabled(0, 0)});
    enable(true);
    host.clock().pass(7ms);
    EXPECT_FALSE(platform::data_available(queue));
    EXPECT_EQ(call(coprocessor, 3, {0x23}, {}, 0).code, platform::success);
    EXPECT_EQ(receive().size(), 7U);
    EXPECT_EQ(receive().size(), 13U);
}

TEST_F(virtual_profiler, full_queue_loses_events_and_the_numbers_tell) {
    configure({enabled(0, 0)});
    enable(true);
    host.clock().pass(3600s);
    const auto events = receive();
    EXPECT_EQ(events.size(), event_stream::capacity);
    EXPECT_EQ(events.back().time, 3'600'000'000U);
    EXPECT_EQ(events.back().sequence - events.front().sequence, event_stream::capacity - 1);
}

TEST_F(virtual_profiler, logs_note_what_was_done_and_are_emptied_by_reading) {
    const auto kernel_log = [&] { return call(kernel, 9, {}, {}, 48000).bytes; };
    const auto coprocessor_log = [&] { return call(coprocessor, 2, {0xd1}, {}, 65536).bytes; };
    kernel_log();
    coprocessor_log();
    configure({enabled(0, 0)});
    enable(true);
    set_duration(9);
    const byte_list kernel_notes = kernel_log();
    ASSERT_EQ(kernel_notes.size(), 96U);
    EXPECT_EQ(kernel_notes[1], 1U);
    EXPECT_EQ(kernel_notes[48 + 1], 2U);
    EXPECT_EQ(kernel_notes[3], 8U);
    const byte_list notes = coprocessor_log();
    ASSERT_EQ(notes.size(), 96U);
    EXPECT_EQ(notes[48 + 1], 6U);
    EXPECT_EQ(platform::simulated::get_u32(notes, 48 + 16), 9000U);
    EXPECT_TRUE(kernel_log().empty());
    EXPECT_TRUE(coprocessor_log().empty());
    enable(false);
    enable(true);
    EXPECT_EQ(call(kernel, 9, {}, {}, 95).bytes.size(), 48U);
    EXPECT_EQ(kernel_log().size(), 48U);
}

TEST_F(virtual_profiler, error_dump_holds_the_last_events) {
    EXPECT_TRUE(call(kernel, 8, {}, {}, 48000).bytes.empty());
    configure({enabled(0, 0)});
    enable(true);
    receive();
    receive();
    EXPECT_EQ(call(kernel, 10, {}, {}, 0).code, platform::success);
    const byte_list dump = call(kernel, 8, {}, {}, 48000).bytes;
    ASSERT_EQ(dump.size(), 33U * 48U);
    EXPECT_EQ(read_event({dump.end() - 96, dump.end() - 48}).time, 40000U);
    EXPECT_EQ(dump[32 * 48 + 3], 8U);
}

TEST_F(virtual_profiler, statistics_move_and_can_be_cleared) {
    const auto sources = [&] {
        return call(coprocessor, 3, {0x20}, {0, 0, 0, 0, 1, 0, 0, 0}, 12800).bytes;
    };
    const auto count = [&] { return platform::simulated::get_u32(sources(), 48); };
    const auto wakes = [&] {
        const byte_list counts = call(coprocessor, 3, {0x20}, {10, 0, 0, 0, 0, 0, 0, 0}, 108).bytes;
        return platform::simulated::get_u32(counts, 4);
    };
    EXPECT_EQ(sources().size() % 64, 0U);
    EXPECT_EQ(count(), 0U);
    EXPECT_EQ(wakes(), 0U);
    host.clock().pass(60s);
    EXPECT_EQ(count(), 1200U);
    EXPECT_EQ(wakes(), 15U);
    EXPECT_EQ(call(coprocessor, 3, {0x20}, {0, 0, 0, 0, 0, 0, 0, 0}, 0).code, platform::success);
    EXPECT_EQ(count(), 0U);
    EXPECT_EQ(wakes(), 15U);
}

TEST_F(virtual_profiler, client_is_connected_as_long_as_the_profiler_is_enabled) {
    const auto status = [&] {
        std::array<std::uint64_t, 1> scalars{7};
        platform::call_outputs outputs{scalars, {}};
        EXPECT_EQ(platform::call(kernel, 1, {}, outputs), platform::success);
        return scalars[0];
    };
    EXPECT_EQ(status(), 0U);
    enable(true);
    EXPECT_EQ(status(), 1U);
    enable(false);
    EXPECT_EQ(status(), 0U);
}

}  // namespace tests
