// The embedded device has everything that the tool asks for.
#include "platform/virtual/wrist_device.h"

#include <algorithm>
#include <array>
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

using platform::service;
using byte_list = std::vector<std::uint8_t>;

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

    [[nodiscard]] std::ptrdiff_t count_of_class(std::string_view name) const {
        return std::ranges::count_if(device_->entries(), [&](const auto& entry) {
            return !entry->classes.empty() && entry->classes.front() == name;
        });
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

TEST_F(wrist_device, has_every_service_under_an_id_of_its_own_and_the_hid_devices_below_theirs) {
    const std::set<std::string> sensors{"accel",    "gyro", "compass",
                                        "pressure", "als",  "temperature"};
    std::set<std::int32_t> ids;
    for (const std::string name :
         {"wqr-button", "arc", "btmspk", "mux", "baseband", "morvane", "accel", "gyro", "compass",
          "pressure", "als", "temperature", "mca", "profile", "NRXApp"}) {
        std::int32_t id = 0;
        EXPECT_TRUE(nrx::resolve_service_id(name, id)) << name;
        EXPECT_TRUE(ids.insert(id).second) << name;
        std::string registered;
        EXPECT_TRUE(nrx::service_name_for_id(id, registered));
        EXPECT_EQ(registered, name == "wqr-button" ? "WQR_wqr-button" : name);
        if (name != "wqr-button" && !sensors.contains(name)) continue;
        const service device = nrx::find_hid_device(name);
        EXPECT_TRUE(create_hid_device(device)) << name;
        std::string attached;
        std::string found;
        entry_name(first_child(nrx::find_service(name), "IOService"), attached);
        entry_name(device, found);
        EXPECT_EQ(attached, found);
    }
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
    for (const auto& [name, id, length] :
         {expected{"wqr-button", 0xd0, 48}, expected{"wqr-button", 0xd1, 32},
          expected{"wqr-button", 0xd7, 282}, expected{"wqr-button", 0xd8, 1479},
          expected{"wqr-button", 0xe3, 64}, expected{"arc", 0xd0, 40}, expected{"btmspk", 0xd0, 32},
          expected{"mux", 0xd0, 7 * 12}, expected{"mux", 0xd1, 16}, expected{"mux", 0x45, 5 * 32},
          expected{"baseband", 0xd0, 64}, expected{"morvane", 0xd0, 40},
          expected{"accel", 0xe3, 64}, expected{"gyro", 0xe3, 64}, expected{"compass", 0xe3, 64},
          expected{"accel", 0x53, 28}, expected{"gyro", 0x53, 28}, expected{"compass", 0x53, 28}}) {
        EXPECT_EQ(report(name, id).size(), length) << name << " " << id;
    }
}

TEST_F(wrist_device, tells_values_that_agree) {
    const byte_list press = report("wqr-button", 0xd7);
    ASSERT_EQ(press.size(), 282U);
    std::vector<std::uint64_t> times;
    // Finger on, second scan, then down, its asset, up, its asset of each click, finger off.
    for (const std::size_t offset : {0U, 266U, 88U, 136U, 96U, 144U, 104U, 152U, 112U, 160U, 8U})
        times.push_back(nrx::load_le<std::uint64_t>(press.data() + offset));
    EXPECT_TRUE(std::is_sorted(times.begin(), times.end()));
    EXPECT_EQ(u32(press, 184), times[3] - times[2]);
    for (const char* name : {"wqr-button", "accel", "gyro", "compass"}) {
        const byte_list errors = report(name, 0xe3);
        ASSERT_EQ(errors.size(), 64U);
        EXPECT_EQ(u32(errors, 4), u32(errors, 12) + u32(errors, 28)) << name;
        EXPECT_EQ(u32(errors, 40),
                  u32(errors, 44) + u32(errors, 0) + u32(errors, 52) + u32(errors, 60))
            << name;
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
    EXPECT_EQ(count_of_class("KeltoNRXHIDInterface"), 7);
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

}  // namespace
