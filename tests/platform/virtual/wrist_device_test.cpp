// The embedded device has everything that the tool asks for.
#include "platform/virtual/wrist_device.h"

#include <set>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "platform/hid_device.h"
#include "platform/registry.h"
#include "platform/virtual/current_machine.h"

namespace {

const std::vector<std::string> sensors{"accel",    "gyro", "compass",
                                       "pressure", "als",  "temperature"};

class wrist_device : public ::testing::Test {
public:
    wrist_device() = default;
    ~wrist_device() override { EXPECT_EQ(device_->open_handles(), 0U); }
    wrist_device(const wrist_device&) = delete;
    wrist_device& operator=(const wrist_device&) = delete;

private:
    std::unique_ptr<platform::simulated::machine> device_ =
        platform::simulated::make_wrist_device();
    platform::simulated::installed_machine installed_{*device_};
};

TEST_F(wrist_device, has_every_service_under_an_id_of_its_own_and_the_hid_devices_below_theirs) {
    std::set<std::string> names(sensors.begin(), sensors.end());
    names.insert("wqr-button");
    for (const std::string& name : names) {
        const platform::service device = nrx::find_hid_device(name);
        EXPECT_TRUE(create_hid_device(device)) << name;
        std::string attached;
        std::string found;
        entry_name(first_child(nrx::find_service(name), "IOService"), attached);
        entry_name(device, found);
        EXPECT_EQ(attached, found);
    }
    names.insert({"arc", "btmspk", "mux", "baseband", "morvane", "mca", "profile", "NRXApp"});
    std::set<std::int32_t> ids;
    for (const std::string& name : names) {
        std::int32_t id = 0;
        EXPECT_TRUE(nrx::resolve_service_id(name, id)) << name;
        EXPECT_TRUE(ids.insert(id).second) << name;
    }
    EXPECT_TRUE(nrx::service_conn("NRXApp").open());
}

TEST_F(wrist_device, has_every_report_in_its_length) {
    struct expected {
        std::string service;
        std::uint32_t id;
        std::size_t length;
    };
    std::vector<expected> reports{
        {"wqr-button", 0xd0, 48},   {"wqr-button", 0xd1, 32}, {"wqr-button", 0xd7, 282},
        {"wqr-button", 0xd8, 1479}, {"wqr-button", 0xe3, 64}, {"arc", 0xd0, 40},
        {"btmspk", 0xd0, 32},       {"mux", 0xd0, 7 * 12},    {"mux", 0xd1, 16},
        {"mux", 0x45, 5 * 32},      {"baseband", 0xd0, 64},   {"morvane", 0xd0, 40},
        {"NRXApp", 0x47, 4 * 12}};
    for (const char* name : {"accel", "gyro", "compass"}) {
        reports.push_back({name, 0xe3, 64});
        reports.push_back({name, 0x53, 28});
    }
    for (const auto& [name, id, length] : reports) {
        std::vector<std::uint8_t> bytes(4096);
        platform::byte_span room = bytes;
        EXPECT_EQ(nrx::get_report(name, id, room), platform::success) << name << " " << id;
        EXPECT_EQ(room.size(), length) << name << " " << id;
    }
}

TEST_F(wrist_device, has_sensors_that_tell_who_uses_them) {
    for (const std::string& name : sensors) {
        std::vector<std::uint8_t> clients(496);
        platform::byte_span entries = clients;
        EXPECT_EQ(nrx::send_command(name, 0x39, {}, entries), platform::success) << name;
        EXPECT_EQ(entries.size() % 31, 0U);
    }
}

}  // namespace
