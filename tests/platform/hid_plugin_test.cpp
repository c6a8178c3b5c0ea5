#include "platform/hid_plugin.h"

#include "platform/run_loop.h"
#include "platform/virtual/return_codes.h"
#include "tests/support/hid_host.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using platform::create_hid_plugin;
using platform::first_match;
using platform::query_hid_interface;
using lines = std::vector<std::string>;

class hid_plugin : public device_test {
protected:
    void TearDown() override {
        device.reset();
        device_test::TearDown();
    }

    static platform::return_code ignore_records(const platform::hid_interface& of) {
        return set_record_callback(of, [](platform::byte_view) {});
    }

    scripted_records& records = put_hid_device(host, "accel-hid", 16);
    platform::service service = first_match({{"LocationID", 16}});
    platform::hid_interface device = query_hid_interface(create_hid_plugin(service));
};

TEST_F(hid_plugin, is_made_for_devices_whose_driver_brings_one) {
    EXPECT_TRUE(create_hid_plugin(service));
    EXPECT_FALSE(create_hid_plugin(platform::service()));
    host.add({.name = "bare", .hid = std::make_shared<platform::simulated::hid_unit>()});
    EXPECT_FALSE(create_hid_plugin(first_match({{"IONameMatch", "bare"}})));
    EXPECT_FALSE(query_hid_interface(platform::hid_plugin()));
    const platform::hid_plugin plugin = create_hid_plugin(service);
    host.remove("accel-hid");
    EXPECT_FALSE(create_hid_plugin(service));
    EXPECT_FALSE(query_hid_interface(plugin));
    service.reset();
}

TEST_F(hid_plugin, and_its_interface_are_counted_and_logged_until_they_are_released) {
    device.reset();
    EXPECT_EQ(host.open_handles(), 1U);
    {
        const platform::hid_plugin plugin = create_hid_plugin(service);
        const platform::hid_interface other = query_hid_interface(plugin);
        EXPECT_EQ(host.open_handles(), 3U);
        schedule_on_loop(other);
        ignore_records(other);
        set_mode(other, 16, 2);
    }
    service.reset();
    EXPECT_EQ(lines(host.log().end() - 8, host.log().end()),
              (lines{"create hid plugin accel-hid", "query hid interface accel-hid",
                     "schedule hid interface accel-hid", "set record callback accel-hid",
                     "set mode accel-hid service 16 mode 2", "release hid interface accel-hid",
                     "destroy hid plugin accel-hid", "release accel-hid"}));
}

TEST_F(hid_plugin, sends_records_to_the_callback_that_was_installed_last) {
    service.reset();
    std::vector<byte_list> got;
    records.script = {{1ms, {1}}, {2ms, {2, 3}}, {3ms, {}}};
    EXPECT_EQ(set_mode(device, 16, 1), platform::success);
    EXPECT_EQ(schedule_on_loop(device), platform::success);
    EXPECT_EQ(platform::run_loop_for(1ms), platform::success);
    const auto keep = [&](platform::byte_view record) {
        got.emplace_back(record.begin(), record.end());
    };
    EXPECT_EQ(set_record_callback(device,
                                  [&](platform::byte_view record) {
                                      set_record_callback(device, keep);
                                      keep(record);
                                  }),
              platform::success);
    EXPECT_EQ(platform::run_loop_for(2ms), platform::success);
    EXPECT_EQ(got, (std::vector<byte_list>{{2, 3}, {}}));
    EXPECT_EQ(set_mode(device, 16, 0), platform::success);
    EXPECT_EQ(records.modes, (decltype(records.modes){{16, 1}, {16, 0}}));
}

TEST_F(hid_plugin, answers_with_the_code_of_the_device_and_not_found_when_it_is_gone) {
    service.reset();
    records.mode_result = platform::bad_argument;
    EXPECT_EQ(set_mode(device, 17, 1), platform::bad_argument);
    const platform::hid_interface none;
    host.remove("accel-hid");
    for (const platform::hid_interface* one :
         std::initializer_list<const platform::hid_interface*>{&device, &none}) {
        EXPECT_EQ(schedule_on_loop(*one), platform::not_found);
        EXPECT_EQ(ignore_records(*one), platform::not_found);
        EXPECT_EQ(set_mode(*one, 16, 1), platform::not_found);
    }
}

TEST_F(hid_plugin, every_call_can_be_made_to_fail) {
    const platform::hid_plugin plugin = create_hid_plugin(service);
    records.script = {{1ms, {1}}};
    for (const failure how : platform::simulated::all_failures) {
        host.fail_call(1, how);
        EXPECT_FALSE(create_hid_plugin(service));
        host.fail_call(1, how);
        EXPECT_FALSE(query_hid_interface(plugin));
        host.fail_call(1, how);
        EXPECT_EQ(schedule_on_loop(device), code_of(how));
        host.fail_call(1, how);
        EXPECT_EQ(ignore_records(device), code_of(how));
        host.fail_call(1, how);
        EXPECT_EQ(set_mode(device, 16, 1), code_of(how));
    }
    EXPECT_TRUE(records.modes.empty());
    EXPECT_EQ(platform::run_loop(), platform::simulated::endless_wait);
    service.reset();
}

}  // namespace

}  // namespace tests
