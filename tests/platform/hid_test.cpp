// The contract of HID devices, their plug-ins, and clients of the HID event system.

#include "platform/hid_device.h"
#include "platform/hid_event_client.h"
#include "platform/hid_plugin.h"
#include "platform/run_loop.h"
#include "tests/support/hid_host.h"

namespace tests {

using namespace platform;
using namespace std::chrono_literals;
using simulated::io_failure;
using simulated::virtual_hid_device;

class hid_devices : public device_test {
protected:
    hid_devices() {
        hid->set_feature_report(0xe0, {0xe0, 1, 2});
        hid->set_feature_report(0xe1, {});
        host.add({.name = "button", .hid = hid});
        host.add({.name = "bare"});
        device = create_hid_device(service_named("button"));
    }

    // Reads a report into a zeroed buffer. A failure must leave the span and the buffer as they
    // were.
    void read(std::uint8_t id, std::size_t capacity, return_code code,
              const byte_list& bytes = {}) {
        byte_list buffer(capacity);
        byte_span report = buffer;
        EXPECT_EQ(read_feature_report(device, id, report), code);
        EXPECT_EQ(byte_list(report.begin(), report.end()),
                  code == success ? bytes : byte_list(capacity));
    }

    std::shared_ptr<virtual_hid_device> hid = std::make_shared<virtual_hid_device>();
    hid_device device;
};

TEST_F(hid_devices, read_feature_reports_while_they_are_open) {
    host.fail_call(1, failure::io);
    EXPECT_EQ(open(device), io_failure);
    read(0xe0, 8, bad_argument);
    EXPECT_EQ(close(device), bad_argument);
    EXPECT_EQ(open(device), success);
    read(0xe0, 3, success, {0xe0, 1, 2});
    read(0xe1, 8, success);
    read(0xe0, 2, bad_argument);
    read(0xe4, 8, unsupported);
    host.fail_call(1, failure::io);
    read(0xe1, 8, io_failure);
    host.fail_call(1, failure::io);
    EXPECT_EQ(close(device), io_failure) << "closed nevertheless";
    EXPECT_EQ(close(device), bad_argument);
    read(0xe1, 8, bad_argument);
}

class hid_plugins : public device_test {
protected:
    scripted_records& records = add_hid_device(host, "accel-hid", 16);
    hid_interface device = query_hid_interface(create_hid_plugin(service_named("accel-hid")));
};

TEST_F(hid_plugins, are_created_only_for_drivers_that_have_one) {
    const service accel = service_named("accel-hid");
    const hid_plugin plugin = create_hid_plugin(accel);
    EXPECT_TRUE(plugin);
    EXPECT_EQ(host.open_handles(), 3U);
    host.add({.name = "bare", .hid = std::make_shared<virtual_hid_device>()});
    EXPECT_FALSE(create_hid_plugin(service_named("bare")));
    EXPECT_FALSE(create_hid_plugin({}));
    EXPECT_FALSE(query_hid_interface({}));
    host.remove("accel-hid");
    EXPECT_FALSE(create_hid_plugin(accel));
    EXPECT_FALSE(query_hid_interface(plugin));
}

TEST_F(hid_plugins, deliver_records_to_the_callback_set_last) {
    std::vector<byte_list> delivered;
    records.script = {{1ms, {1}}, {2ms, {2, 3}}, {3ms, {}}};
    EXPECT_EQ(set_mode(device, 16, 1), success);
    EXPECT_EQ(schedule_on_loop(device), success);
    EXPECT_EQ(run_loop_for(1ms), success);
    const auto keep = [&](byte_view record) {
        delivered.emplace_back(record.begin(), record.end());
    };
    const auto keep_and_replace = [&](byte_view record) {
        set_record_callback(device, keep);
        keep(record);
    };
    EXPECT_EQ(set_record_callback(device, keep_and_replace), success);
    EXPECT_EQ(run_loop_for(2ms), success);
    EXPECT_EQ(delivered, (std::vector<byte_list>{{2, 3}, {}}));
    EXPECT_EQ(set_mode(device, 16, 0), success);
    EXPECT_EQ(records.modes, (decltype(records.modes){{16, 1}, {16, 0}}));
}

class hid_event_clients : public device_test {
protected:
    hid_event_clients() {
        set_hid_events_script(host, {{1ms, hid_event{.ticks = 5, .type = 13}},
                                     {2ms, simulated::hid_reset{}},
                                     {3ms, simulated::statistics_update{1, 2, 3}}});
    }

    void set_callbacks(const hid_event_client& client, return_code code) {
        const auto on_event = [&](const hid_event& event) {
            delivered += "event " + std::to_string(event.type) + ", ";
        };
        const auto on_statistics = [&](byte_view records) {
            delivered += "update " + std::to_string(records.size()) + ", ";
        };
        EXPECT_EQ(set_event_callback(client, on_event), code);
        EXPECT_EQ(set_reset_callback(client, [&] { delivered += "reset, "; }), code);
        EXPECT_EQ(set_statistics_callback(client, on_statistics), code);
    }

    std::string delivered;
};

TEST_F(hid_event_clients, receive_notifications_once_they_have_callbacks) {
    const hid_event_client early = create_hid_event_client();
    const hid_event_client late = create_hid_event_client();
    set_callbacks(early, success);
    EXPECT_EQ(schedule_on_loop(early), success);
    EXPECT_EQ(schedule_on_loop(late), success);
    EXPECT_EQ(run_loop_for(2ms), success);
    EXPECT_EQ(delivered, "event 13, reset, ");
    set_callbacks(late, success);
    EXPECT_EQ(run_loop_for(8ms), success);
    EXPECT_EQ(delivered, "event 13, reset, update 3, update 3, ");
}

TEST_F(hid_event_clients, need_an_event_system_and_a_handle) {
    set_callbacks({}, not_found);
    EXPECT_EQ(schedule_on_loop(hid_event_client()), not_found);
    EXPECT_FALSE(list_hid_services({}));
    host.set_hid_events({});
    EXPECT_FALSE(create_hid_event_client());
}

}  // namespace tests
