// What the wrist device sends of its own accord, and the driver of its HID devices.

#include <map>
#include <set>

#include "nrxctl/base/hid_driver.h"
#include "platform/clock.h"
#include "platform/hid_event_client.h"
#include "platform/hid_plugin.h"
#include "platform/run_loop.h"
#include "platform/virtual/wrist/parts.h"
#include "tests/support/device_test.h"

namespace tests {

namespace {

using namespace std::chrono_literals;

class wrist_events : public device_test {
protected:
    wrist_events() {
        add_interface_services(host);
        add_hid_devices(host);
        add_hid_driver(host);
        add_spi_records(host);
        add_hid_events(host);
    }

    static void ask_driver(const byte_list& request, platform::return_code expected,
                           const byte_list& answer = {}) {
        byte_list buffer(16);
        platform::byte_span reply = buffer;
        reported(expected, [&] { return nrx::call_hid_driver(request, reply); });
        if (expected != platform::success) return;
        byte_list whole = request;
        whole.insert(whole.end(), answer.begin(), answer.end());
        whole.resize(16);
        EXPECT_EQ(byte_list(reply.begin(), reply.end()), whole);
    }
};

TEST_F(wrist_events, hid_devices_send_records_of_all_types_while_their_mode_is_on) {
    for (const char* name : {"accel-hid", "gyro-hid", "wqr-button-hid"}) {
        const auto service = service_named(name);
        const auto location = static_cast<std::int32_t>(
            platform::read_property(service, "LocationID")->number().value());
        const auto device = query_hid_interface(create_hid_plugin(service));
        std::multiset<int> types;
        EXPECT_EQ(schedule_on_loop(device), platform::success);
        set_record_callback(device, [&](platform::byte_view record) { types.insert(record[8]); });
        EXPECT_EQ(set_mode(device, location + 1, 1), platform::bad_argument);
        EXPECT_EQ(platform::run_loop_for(1s), platform::success);
        EXPECT_EQ(types.size(), 0U);
        for (const std::uint32_t mode : {2U, 0U}) {
            EXPECT_EQ(set_mode(device, location, mode), platform::success);
            EXPECT_EQ(platform::run_loop_for(1s), platform::success);
            EXPECT_EQ(types.size(), 20U);
        }
        for (int type = 0; type < 4; ++type)
            EXPECT_TRUE(types.contains(type)) << type;
    }
}

TEST_F(wrist_events, events_come_in_their_rhythm_and_a_vendor_event_is_late_at_times) {
    const auto client = platform::create_hid_event_client();
    std::map<std::uint32_t, int> events;
    std::vector<double> beats;
    int resets = 0;
    std::size_t statistics = 0;
    set_event_callback(client, [&](const platform::hid_event& event) {
        const auto happened = static_cast<double>(event.ticks) * platform::tick_period();
        const auto now = std::chrono::duration<double>(host.clock().now()).count();
        EXPECT_NEAR(now - happened, static_cast<double>(event.latency(1)) / 1e9, 1e-6);
        ++events[event.type];
        if (event.type == platform::vendor_defined_event) beats.push_back(happened);
    });
    set_reset_callback(client, [&] { ++resets; });
    set_statistics_callback(client,
                            [&](platform::byte_view update) { statistics += update.size(); });
    EXPECT_EQ(schedule_on_loop(client), platform::success);
    EXPECT_EQ(platform::run_loop_for(10s), platform::success);
    EXPECT_EQ(events, (std::map<std::uint32_t, int>{{platform::null_event, 10},
                                                    {platform::vendor_defined_event, 20},
                                                    {2, 7},
                                                    {platform::accelerometer_event, 50}}));
    EXPECT_EQ(resets, 1);
    EXPECT_EQ(statistics, 15U * 7U);
    for (std::size_t i = 1; i < beats.size(); ++i) {
        const double expected = i % 7 == 6 ? 0.65 : i % 7 == 0 ? 0.35 : 0.5;
        EXPECT_NEAR(beats[i] - beats[i - 1], expected, 1e-6) << i;
    }
}

TEST_F(wrist_events, the_hid_driver_answers_requests_about_the_devices_that_are_there) {
    ask_driver({1, 0, 0, 0, 9, 0, 0, 0}, platform::success, {7});
    ask_driver({2, 0, 0, 0, 0x40, 0, 0, 0}, platform::success, {2});
    ask_driver({0, 0, 0, 0, 0, 0, 0, 0}, platform::success, {0x0c, 1, 3});
    ask_driver({2, 0, 0, 0, 0x41, 0, 0, 0}, platform::not_found);
    ask_driver({3, 0, 0, 0, 0, 0, 0, 0}, platform::unsupported);
    ask_driver({1, 0, 0, 0}, platform::bad_argument);
    host.remove("wqr-button-hid");
    ask_driver({1, 0, 0, 0, 9, 0, 0, 0}, platform::success, {6});
    ask_driver({2, 0, 0, 0, 0x40, 0, 0, 0}, platform::not_found);
}

}  // namespace

}  // namespace tests
