#include "platform/hid_plugin.h"

#include "platform/run_loop.h"
#include "tests/support/hid_host.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using platform::create_hid_plugin;
using platform::query_hid_interface;

class hid_plugin : public device_test {
protected:
    static platform::return_code ignore_records(const platform::hid_interface& of) {
        return set_record_callback(of, [](platform::byte_view) {});
    }

    scripted_records& records = put_hid_device(host, "accel-hid", 16);
    platform::hid_interface device =
        query_hid_interface(create_hid_plugin(service_named("accel-hid")));
};

TEST_F(hid_plugin, is_made_for_devices_whose_driver_brings_one) {
    const platform::service service = service_named("accel-hid");
    const platform::hid_plugin plugin = create_hid_plugin(service);
    EXPECT_TRUE(plugin);
    EXPECT_EQ(host.open_handles(), 3U);
    host.add({.name = "bare", .hid = std::make_shared<platform::simulated::hid_unit>()});
    EXPECT_FALSE(create_hid_plugin(service_named("bare")));
    EXPECT_FALSE(create_hid_plugin({}));
    EXPECT_FALSE(query_hid_interface({}));
    host.remove("accel-hid");
    EXPECT_FALSE(create_hid_plugin(service));
    EXPECT_FALSE(query_hid_interface(plugin));
}

TEST_F(hid_plugin, sends_records_to_the_callback_that_was_installed_last) {
    std::vector<byte_list> got;
    records.script = {{1ms, {1}}, {2ms, {2, 3}}, {3ms, {}}};
    EXPECT_EQ(set_mode(device, 16, 1), platform::success);
    EXPECT_EQ(schedule_on_loop(device), platform::success);
    EXPECT_EQ(platform::run_loop_for(1ms), platform::success);
    const auto keep = [&](platform::byte_view record) {
        got.emplace_back(record.begin(), record.end());
    };
    const auto keep_and_replace = [&](platform::byte_view record) {
        set_record_callback(device, keep);
        keep(record);
    };
    EXPECT_EQ(set_record_callback(device, keep_and_replace), platform::success);
    EXPECT_EQ(platform::run_loop_for(2ms), platform::success);
    EXPECT_EQ(got, (std::vector<byte_list>{{2, 3}, {}}));
    EXPECT_EQ(set_mode(device, 16, 0), platform::success);
    EXPECT_EQ(records.modes, (decltype(records.modes){{16, 1}, {16, 0}}));
}

TEST_F(hid_plugin, answers_with_the_code_of_the_device_and_not_found_when_it_is_gone) {
    records.mode_result = platform::bad_argument;
    EXPECT_EQ(set_mode(device, 17, 1), platform::bad_argument);
    host.remove("accel-hid");
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(schedule_on_loop(device), platform::not_found);
        EXPECT_EQ(ignore_records(device), platform::not_found);
        EXPECT_EQ(set_mode(device, 16, 1), platform::not_found);
        device.reset();
    }
}

}  // namespace

}  // namespace tests
