// The embedded device answers everything that the tool asks about, and its values agree.
#include "platform/virtual/wrist_device.h"

#include <algorithm>
#include <array>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "platform/hid_device.h"
#include "platform/registry.h"

namespace {

using platform::dictionary;
using platform::first_match;
using platform::service;
using platform::simulated::entry_ref;

using byte_list = std::vector<std::uint8_t>;

constexpr std::array interface_services{
    "wqr-button", "arc",      "btmspk", "mux",         "baseband", "morvane", "accel", "gyro",
    "compass",    "pressure", "als",    "temperature", "mca",      "profile", "NRXApp"};

class wrist_device : public ::testing::Test {
protected:
    void TearDown() override { EXPECT_EQ(device_->open_handles(), 0U); }

    static byte_list report(std::string_view service_name, std::uint32_t id) {
        byte_list bytes(4096);
        platform::byte_span room = bytes;
        EXPECT_EQ(nrx::get_report(service_name, id, room), platform::success)
            << service_name << " " << id;
        bytes.resize(room.size());
        return bytes;
    }

    [[nodiscard]] std::vector<entry_ref> of_class(std::string_view name) const {
        std::vector<entry_ref> found;
        std::copy_if(device_->entries().begin(), device_->entries().end(),
                     std::back_inserter(found), [&](const entry_ref& entry) {
                         return !entry->classes.empty() && entry->classes.front() == name;
                     });
        return found;
    }

private:
    std::unique_ptr<platform::simulated::machine> device_ =
        platform::simulated::make_wrist_device();
    platform::simulated::installed_machine installed_{*device_};
};

template <class Number>
std::int64_t number(const byte_list& bytes, std::size_t offset) {
    EXPECT_LE(offset + sizeof(Number), bytes.size());
    return static_cast<std::int64_t>(nrx::load_le<Number>(bytes.data() + offset));
}

std::int64_t u32(const byte_list& bytes, std::size_t offset) {
    return number<std::uint32_t>(bytes, offset);
}

std::int64_t s32(const byte_list& bytes, std::size_t offset) {
    return number<std::int32_t>(bytes, offset);
}

std::int64_t u64(const byte_list& bytes, std::size_t offset) {
    return number<std::uint64_t>(bytes, offset);
}

TEST_F(wrist_device, has_every_service_under_an_id_of_its_own) {
    std::set<std::int32_t> ids;
    for (const char* name : interface_services) {
        std::int32_t id = 0;
        EXPECT_TRUE(nrx::resolve_service_id(name, id)) << name;
        EXPECT_TRUE(ids.insert(id).second) << name;
        std::string registered;
        EXPECT_TRUE(nrx::service_name_for_id(id, registered));
        EXPECT_TRUE(registered == name || registered == std::string("WQR_") + name) << registered;
    }
    EXPECT_TRUE(first_match({{"IONameMatch", "WQR_wqr-button"}}));
    EXPECT_FALSE(first_match({{"IONameMatch", "wqr-button"}}));
}

TEST_F(wrist_device, has_a_hid_device_for_the_button_and_for_each_sensor) {
    for (const char* name :
         {"wqr-button", "accel", "gyro", "compass", "pressure", "als", "temperature"}) {
        const service device = nrx::find_hid_device(name);
        EXPECT_TRUE(create_hid_device(device)) << name;
        const service owner = nrx::find_service(name);
        std::string attached;
        std::string found;
        entry_name(first_child(owner, "IOService"), attached);
        entry_name(device, found);
        EXPECT_EQ(attached, found);
    }
    std::set<std::int64_t> locations;
    for (const entry_ref& entry : of_class("KeltoNRXHIDDevice")) {
        const auto* location = entry->properties.find("LocationID");
        ASSERT_NE(location, nullptr) << entry->name;
        EXPECT_TRUE(locations.insert(*location->number()).second) << entry->name;
        EXPECT_TRUE(nrx::find_service(std::to_string(*location->number()))) << entry->name;
        ASSERT_NE(entry->properties.find("DeviceUsagePairs"), nullptr) << entry->name;
    }
}

TEST_F(wrist_device, has_the_feature_reports_of_the_button) {
    const service button = first_match(
        {{"DeviceUsagePairs",
          platform::array{dictionary{{"DeviceUsagePage", 0xff00}, {"DeviceUsage", 0x20}}}},
         {"IOProviderClass", "IOHIDDevice"}});
    const auto device = create_hid_device(button);
    EXPECT_EQ(open(device), platform::success);
    for (const std::uint8_t id :
         std::to_array<std::uint8_t>({0xe0, 0xb4, 0xe1, 0xe2, 0xe3, 0xe4})) {
        std::array<std::uint8_t, 256> room{};
        platform::byte_span bytes = room;
        EXPECT_EQ(feature_report(device, id, bytes), platform::success) << int{id};
        EXPECT_EQ(room[0], id);
        EXPECT_LT(bytes.size(), 256U);
    }
    EXPECT_EQ(close(device), platform::success);
}

TEST_F(wrist_device, lets_the_client_of_the_replay_application_be_opened) {
    EXPECT_TRUE(nrx::service_conn("NRXApp").open(false));
}

TEST_F(wrist_device, plays_samples_back_with_the_sensors_of_motion_and_pressure) {
    const byte_list states = report("NRXApp", 0x47);
    ASSERT_EQ(states.size(), 4 * 12U);
    std::vector<std::string> names;
    for (std::size_t offset = 0; offset < states.size(); offset += 12) {
        EXPECT_TRUE(nrx::service_name_for_id(static_cast<std::int32_t>(u32(states, offset)),
                                             names.emplace_back()));
        EXPECT_EQ(u32(states, offset + 8), 0);
    }
    EXPECT_EQ(names, (std::vector<std::string>{"accel", "gyro", "compass", "pressure"}));
}

TEST_F(wrist_device, has_every_report_in_its_length) {
    struct expected {
        const char* service;
        std::uint32_t id;
        std::size_t length;
    };
    for (const auto& [name, id, length] : {
             expected{"wqr-button", 0xd0, 48},
             expected{"wqr-button", 0xd1, 32},
             expected{"wqr-button", 0xd7, 282},
             expected{"wqr-button", 0xd8, 1479},
             expected{"wqr-button", 0xe3, 64},
             expected{"arc", 0xd0, 40},
             expected{"btmspk", 0xd0, 32},
             expected{"mux", 0xd0, 7 * 12},
             expected{"mux", 0xd1, 16},
             expected{"mux", 0x45, 5 * 32},
             expected{"baseband", 0xd0, 64},
             expected{"morvane", 0xd0, 40},
             expected{"accel", 0xe3, 64},
             expected{"gyro", 0xe3, 64},
             expected{"compass", 0xe3, 64},
             expected{"accel", 0x53, 28},
             expected{"gyro", 0x53, 28},
             expected{"compass", 0x53, 28},
             expected{"temperature", 0x00, 4},
             expected{"accel", 0x43, 20},
             expected{"gyro", 0x0f, 32},
             expected{"compass", 0x0b, 36},
             expected{"compass", 0x1a, 12},
             expected{"gyro", 0x18, 9},
             expected{"als", 0x44, 5},
             expected{"accel", 0x36, 5 * 4},
             expected{"compass", 0x1d, 36},
             expected{"compass", 0xd6, 12},
             expected{"pressure", 0x38, 4 + 3 * 4},
             expected{"accel", 0x31, 4 + 5 * 24},
         }) {
        EXPECT_EQ(report(name, id).size(), length) << name << " " << id;
    }
}

TEST_F(wrist_device, tells_of_a_press_whose_times_add_up) {
    const byte_list press = report("wqr-button", 0xd7);
    EXPECT_EQ(u32(press, 233) >> 1, 2);
    EXPECT_EQ(u64(press, 24), u64(press, 88) - u64(press, 0));
    for (const std::size_t edge : {0U, 8U, 16U, 24U}) {
        EXPECT_EQ(u64(press, 184 + edge), u64(press, 136 + edge) - u64(press, 88 + edge)) << edge;
    }
    const std::array in_order{
        u64(press, 0),    // finger on
        u64(press, 266),  // second scan
        u64(press, 88),   // click 1: down
        u64(press, 16),   // start of haptics
        u64(press, 136),  // click 1: asset for down
        u64(press, 96),   // click 1: up
        u64(press, 144),  // click 1: asset for up
        u64(press, 104),  // click 2, likewise
        u64(press, 152), u64(press, 112), u64(press, 160), u64(press, 8),  // finger off
    };
    EXPECT_TRUE(std::is_sorted(in_order.begin(), in_order.end()));
    EXPECT_LT(u64(press, 8) - u64(press, 0), 1'000'000);
    EXPECT_GT(u32(press, 274), 0);
    EXPECT_GT(u32(press, 278), 0);
}

TEST_F(wrist_device, plays_each_enabled_asset_from_a_slot_of_its_own) {
    const byte_list assets = report("wqr-button", 0xd8);
    std::set<std::int64_t> slots;
    for (std::size_t offset = 0; offset < assets.size(); offset += 29) {
        if (assets[offset] == 0) {
            EXPECT_EQ(s32(assets, offset + 21), -1) << offset;
            continue;
        }
        EXPECT_GE(s32(assets, offset + 1), 0x8000) << offset;
        EXPECT_LE(s32(assets, offset + 1), 0x18000) << offset;
        EXPECT_LT(u64(assets, offset + 5), u64(assets, offset + 13)) << offset;
        EXPECT_TRUE(slots.insert(s32(assets, offset + 21)).second) << offset;
    }
    EXPECT_EQ(slots.size(), 28U);
    EXPECT_EQ(*slots.begin(), 0);
}

TEST_F(wrist_device, counts_no_more_parts_than_there_are) {
    const byte_list scans = report("morvane", 0xd0);
    EXPECT_LE(u32(scans, 36), u32(scans, 24));
    const byte_list link = report("baseband", 0xd0);
    EXPECT_EQ(u32(link, 12), u32(link, 16) + u32(link, 20) + u32(link, 24));
    EXPECT_EQ(u32(link, 36), u32(link, 44) + u32(link, 48) + u32(link, 52));
    EXPECT_LT(u64(link, 4), u64(link, 56));
    const byte_list changes = report("mux", 0xd0);
    for (std::size_t offset = 12; offset < changes.size(); offset += 12) {
        EXPECT_LT(u64(changes, offset - 12), u64(changes, offset));
    }
}

TEST_F(wrist_device, loses_few_packets_and_tells_where_they_went) {
    for (const char* name : {"wqr-button", "accel", "gyro", "compass"}) {
        const byte_list errors = report(name, 0xe3);
        std::int64_t status_errors = 0;
        for (std::size_t offset = 8; offset < 36; offset += 4) {
            status_errors += u32(errors, offset);
        }
        EXPECT_EQ(u32(errors, 4), status_errors) << name;
        EXPECT_EQ(u32(errors, 40),
                  u32(errors, 44) + u32(errors, 0) + u32(errors, 52) + u32(errors, 60))
            << name;
        EXPECT_LE(u32(errors, 36), u32(errors, 0)) << name;
        EXPECT_LT(u32(errors, 0) + u32(errors, 4), 100) << name;
    }
    const byte_list buses = report("mux", 0x45);
    for (std::size_t row = 0; row < buses.size(); row += 32) {
        for (const std::size_t kind : {0U, 8U, 16U}) {
            EXPECT_LE(100 * s32(buses, row + kind + 4), s32(buses, row + kind)) << row;
        }
        EXPECT_NE(buses[row + 24], 0);
        EXPECT_EQ(buses[row + 31], 0);
    }
}

TEST_F(wrist_device, has_sensors_that_sample_at_a_rate_which_they_support) {
    for (const char* name : {"accel", "gyro", "compass", "pressure", "als", "temperature"}) {
        const std::int64_t interval = u32(report(name, 0x00), 0);
        const std::int64_t of_the_part = s32(report(name, 0x33), 0);
        EXPECT_EQ(u32(report(name, 0x24), 0), of_the_part < interval ? 1 : 0) << name;
        EXPECT_EQ(interval % of_the_part, 0) << name;
        const byte_list supported = report(name, 0x3f);
        std::set<std::int64_t> intervals;
        for (std::size_t offset = 0; offset < supported.size(); offset += 4)
            intervals.insert(u32(supported, offset));
        EXPECT_EQ(intervals.count(interval), 1U) << name;
        EXPECT_EQ(intervals.count(of_the_part), 1U) << name;
        const byte_list batching = report(name, 0x43);
        EXPECT_EQ(s32(batching, 16), s32(batching, 8) / interval) << name;
        EXPECT_LT(s32(report(name, 0x3d), 0), 3) << name;
        byte_list clients(496);
        platform::byte_span entries = clients;
        EXPECT_EQ(nrx::send_command(name, 0x39, {}, entries), platform::success) << name;
        EXPECT_EQ(entries.size() % 31, 0U);
        for (std::size_t entry = 0; entry < entries.size(); entry += 31)
            EXPECT_GE(s32(clients, entry + 12), interval) << name;
    }
}

TEST_F(wrist_device, counts_an_event_for_each_packet_that_was_sent_on) {
    EXPECT_EQ(of_class("KeltoNRXHIDInterface").size(), 7U);
    for (const char* name : {"wqr-button", "accel", "gyro", "compass"}) {
        service entry = nrx::find_service(name);
        for (int level = 0; level < 3; ++level)
            entry = first_child(entry, "IOService");
        const auto made = read_property(entry, "DebugState");
        const auto queued = read_property(first_child(entry, "IOService"), "DebugState");
        ASSERT_TRUE(made && queued) << name;
        const auto number = [](const platform::property& state, const char* key) {
            return state.entries()->find(key)->number().value();
        };
        const std::int64_t events = number(*made, "_num_events");
        EXPECT_EQ(events, u32(report(name, 0xe3), 44)) << name;
        EXPECT_EQ(number(*queued, "EnqueueEventCount") + number(*queued, "DroppedEventCount"),
                  events)
            << name;
    }
}

TEST_F(wrist_device, has_sampled_each_axis_between_two_values) {
    for (const char* name : {"accel", "gyro", "compass"}) {
        const byte_list ranges = report(name, 0x53);
        EXPECT_GT(s32(ranges, 0), 0) << name;
        for (std::size_t axis = 4; axis < 28; axis += 8) {
            EXPECT_LT(s32(ranges, axis), s32(ranges, axis + 4)) << name;
        }
    }
}

}  // namespace
