// What the wrist device sends of its own accord, and the drivers that are called beside their
// reports.

#include <algorithm>
#include <map>
#include <set>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/hid_driver.h"
#include "nrxctl/base/mca.h"
#include "nrxctl/base/named_property.h"
#include "nrxctl/base/scalar_method.h"
#include "platform/clock.h"
#include "platform/hid_event_client.h"
#include "platform/hid_plugin.h"
#include "platform/run_loop.h"
#include "platform/virtual/wrist/parts.h"
#include "tests/support/device_test.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using platform::first_match;
using platform::hid_event;

class wrist_events : public device_test {
protected:
    void SetUp() override {
        add_interface_services(host);
        add_hid_devices(host);
        add_named_properties(host);
        add_mca(host);
        add_hid_driver(host);
        add_spi_records(host);
        add_hid_events(host);
    }

    static byte_list property(std::string_view service, std::string_view name) {
        std::array<std::uint8_t, 64> room{};
        platform::byte_span value = room;
        const outcome result = capture([&] { nrx::get_named_property(service, name, value); });
        EXPECT_EQ(result.err, "") << name;
        return {value.begin(), value.end()};
    }

    static platform::return_code ask_driver(const byte_list& request, byte_list& reply) {
        platform::byte_span room = reply;
        platform::return_code result = platform::success;
        capture([&] { result = nrx::call_hid_driver(request, room); });
        reply.resize(room.size());
        return result;
    }
};

TEST_F(wrist_events, every_hid_device_sends_records_of_all_types_while_its_mode_is_on) {
    for (const char* name : {"accel-hid", "gyro-hid", "wqr-button-hid"}) {
        const auto service = first_match({{"IONameMatch", name}});
        const auto location = static_cast<std::int32_t>(
            platform::read_property(service, "LocationID")->number().value());
        const auto device = query_hid_interface(create_hid_plugin(service));
        std::set<int> types;
        std::size_t count = 0;
        EXPECT_EQ(schedule_on_loop(device), platform::success);
        set_record_callback(device, [&](platform::byte_view record) {
            ASSERT_GE(record.size(), 17U);
            types.insert(record[8]);
            ++count;
        });
        EXPECT_EQ(set_mode(device, location + 1, 1), platform::bad_argument);
        EXPECT_EQ(platform::run_loop_for(1s), platform::success);
        EXPECT_EQ(count, 0U);
        EXPECT_EQ(set_mode(device, location, 2), platform::success);
        EXPECT_EQ(platform::run_loop_for(1s), platform::success);
        EXPECT_EQ(count, 20U);
        EXPECT_EQ(types, (std::set<int>{0, 1, 2, 3}));
        EXPECT_EQ(set_mode(device, location, 0), platform::success);
        EXPECT_EQ(platform::run_loop_for(1s), platform::success);
        EXPECT_EQ(count, 20U);
    }
}

TEST_F(wrist_events, events_come_in_their_rhythm_and_a_vendor_event_is_late_at_times) {
    const auto client = platform::create_hid_event_client();
    std::map<std::uint32_t, std::vector<double>> times;
    int resets = 0;
    std::size_t records = 0;
    set_event_callback(client, [&](const hid_event& event) {
        const auto happened = static_cast<double>(event.ticks) * platform::tick_period();
        const auto now = std::chrono::duration<double>(host.clock().now()).count();
        EXPECT_NEAR(now - happened, static_cast<double>(event.latency(1)) / 1e9, 1e-6);
        times[event.type].push_back(happened);
        if (event.type == platform::vendor_defined_event) {
            EXPECT_EQ(event.vendor_data.back(), 0);
        }
    });
    set_reset_callback(client, [&] { ++resets; });
    set_statistics_callback(client, [&](platform::byte_view update) {
        EXPECT_EQ(update.size() % 7, 0U);
        records += update.size() / 7;
    });
    EXPECT_EQ(schedule_on_loop(client), platform::success);
    EXPECT_EQ(platform::run_loop_for(10s), platform::success);
    EXPECT_EQ(times[platform::null_event].size(), 10U);
    EXPECT_EQ(times[platform::accelerometer_event].size(), 50U);
    EXPECT_EQ(times[2].size(), 7U);
    EXPECT_EQ(resets, 1);
    EXPECT_EQ(records, 15U);
    const auto& beats = times[platform::vendor_defined_event];
    ASSERT_EQ(beats.size(), 20U);
    for (std::size_t i = 1; i < beats.size(); ++i) {
        const double expected = i % 7 == 6 ? 0.65 : i % 7 == 0 ? 0.35 : 0.5;
        EXPECT_NEAR(beats[i] - beats[i - 1], expected, 1e-6) << i;
    }
}

TEST_F(wrist_events, mca_tells_what_it_was_switched_to) {
    const outcome on = capture([] { EXPECT_EQ(nrx::switch_mca(true), platform::success); });
    EXPECT_EQ(on.err, "");
    EXPECT_EQ(property("mca", "power"), byte_list{1});
    EXPECT_EQ(property("mca", "mode-16"), (byte_list{3, 0, 0, 0}));
    EXPECT_EQ(property("mca", "mode-60"), (byte_list{1, 0, 0, 0}));
    EXPECT_EQ(property("mca", "mode-128"), (byte_list{3, 0, 0, 0}));
    const outcome off = capture([] { EXPECT_EQ(nrx::switch_mca(false), platform::success); });
    EXPECT_EQ(off.err, "");
    for (const char* name : {"mode-16", "mode-60", "mode-128"})
        EXPECT_EQ(property("mca", name), byte_list(4)) << name;
    EXPECT_EQ(property("mca", "power"), byte_list{0});
}

TEST_F(wrist_events, mca_takes_nothing_that_is_out_of_shape) {
    byte_list payload(69);
    payload[0] = 60;
    payload[4] = 1;
    payload[5] = 2;
    const auto send = [](std::uint32_t command, const byte_list& bytes) {
        platform::byte_span none;
        return nrx::send_command("mca", command, bytes, none, nrx::command_failure::is_silent);
    };
    EXPECT_EQ(send(0x22, payload), platform::success);
    for (const auto& [offset, value] : std::vector<std::pair<std::size_t, std::uint8_t>>{
             {0, 61}, {3, 1}, {4, 0}, {5, 4}, {8, 1}, {9, 1}, {68, 1}}) {
        byte_list wrong = payload;
        wrong[offset] = value;
        EXPECT_EQ(send(0x22, wrong), platform::bad_argument) << offset;
    }
    for (const std::size_t size : {68U, 70U, 0U}) {
        byte_list wrong = payload;
        wrong.resize(size);
        EXPECT_EQ(send(0x22, wrong), platform::bad_argument) << size;
    }
    EXPECT_EQ(send(0x20, {2}), platform::bad_argument);
    EXPECT_EQ(send(0x20, {1, 0}), platform::bad_argument);
    EXPECT_EQ(send(0x21, {1}), platform::unsupported);
    capture([] {
        EXPECT_EQ(nrx::set_report("mca", 0x16, byte_list(3)), platform::bad_argument);
        EXPECT_EQ(nrx::set_report("mca", 0xd8, byte_list(20)), platform::bad_argument);
    });
}

TEST_F(wrist_events, the_hid_driver_answers_requests_of_its_size) {
    byte_list reply(64);
    EXPECT_EQ(ask_driver({1, 0, 0, 0, 9, 0, 0, 0}, reply), platform::success);
    EXPECT_EQ(reply, (byte_list{1, 0, 0, 0, 9, 0, 0, 0, 7, 0, 0, 0, 0, 0, 0, 0}));
    EXPECT_EQ(ask_driver({2, 0, 0, 0, 0x40, 0, 0, 0}, reply), platform::success);
    EXPECT_EQ(reply[8], 2);
    EXPECT_EQ(ask_driver({0, 0, 0, 0, 0, 0, 0, 0}, reply), platform::success);
    EXPECT_EQ(reply[10], 3);
    EXPECT_EQ(ask_driver({2, 0, 0, 0, 0x41, 0, 0, 0}, reply), platform::not_found);
    EXPECT_EQ(ask_driver({3, 0, 0, 0, 0, 0, 0, 0}, reply), platform::unsupported);
    EXPECT_EQ(ask_driver({1, 0, 0, 0}, reply), platform::bad_argument);
    reply.resize(15);
    EXPECT_EQ(ask_driver({1, 0, 0, 0, 0, 0, 0, 0}, reply), platform::simulated::no_room);
    platform::connection opened;
    EXPECT_EQ(open(first_match({{"LocationID", 1234}}), 0, opened), platform::unsupported);
}

TEST_F(wrist_events, a_self_test_leaves_its_result_in_a_property) {
    EXPECT_EQ(property("gyro", "self-test"), byte_list(4));
    capture([] {
        EXPECT_EQ(nrx::call_scalar_method("gyro", std::array<std::uint64_t, 1>{5}),
                  platform::success);
        EXPECT_EQ(nrx::call_scalar_method("gyro", std::array<std::uint64_t, 1>{8}),
                  platform::bad_argument);
        EXPECT_EQ(nrx::call_scalar_method("gyro", std::array<std::uint64_t, 2>{1, 1}),
                  platform::bad_argument);
        EXPECT_EQ(nrx::call_scalar_method("mux", {}), platform::unsupported);
    });
    EXPECT_EQ(property("gyro", "self-test"), (byte_list{5, 0, 0, 0}));
    EXPECT_EQ(property("accel", "gain"), (byte_list{0, 0, 1, 0}));
}

}  // namespace

}  // namespace tests
