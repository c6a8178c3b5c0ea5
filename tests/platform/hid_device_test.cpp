#include "platform/hid_device.h"

#include <array>
#include <memory>

#include "tests/support/device_test.h"

namespace {

using namespace tests;
using platform::create_hid_device;
using platform::first_match;

class hid_device : public device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        unit->set_feature_report(0xe0, {0xe0, 1, 2});
        unit->set_feature_report(0xe1, {});
        host.add({.name = "button", .hid = unit});
        host.add({.name = "bare"});
        device = create_hid_device(first_match({{"IONameMatch", "button"}}));
    }
    void TearDown() override {
        device.reset();
        device_test::TearDown();
    }

    platform::return_code read(std::uint8_t id, std::size_t room) {
        report = platform::byte_span(buffer).first(room);
        return feature_report(device, id, report);
    }

    std::shared_ptr<platform::simulated::hid_unit> unit =
        std::make_shared<platform::simulated::hid_unit>();
    platform::hid_device device;
    std::array<std::uint8_t, 8> buffer{};
    platform::byte_span report;
};

TEST_F(hid_device, reads_feature_reports_between_open_and_close) {
    host.fail_call(1, failure::io);
    EXPECT_EQ(open(device), platform::simulated::io_failure);
    EXPECT_EQ(read(0xe0, 8), platform::bad_argument);
    EXPECT_EQ(close(device), platform::bad_argument);
    EXPECT_EQ(open(device), platform::success);
    EXPECT_EQ(read(0xe0, 3), platform::success);
    EXPECT_EQ(byte_list(report.begin(), report.end()), (byte_list{0xe0, 1, 2}));
    EXPECT_EQ(read(0xe1, 8), platform::success);
    EXPECT_EQ(report.size(), 0U);
    EXPECT_EQ(close(device), platform::success);
    EXPECT_EQ(read(0xe0, 8), platform::bad_argument);
    EXPECT_EQ(report.size(), 8U);
    EXPECT_EQ(close(device), platform::bad_argument);
}

TEST_F(hid_device, leaves_the_room_alone_when_a_report_cannot_be_read) {
    open(device);
    EXPECT_EQ(read(0xe0, 2), platform::bad_argument);
    EXPECT_EQ(report.size(), 2U);
    EXPECT_EQ(read(0xe4, 8), platform::unsupported);
    EXPECT_EQ(report.size(), 8U);
    unit->drop_feature_report(0xe0);
    EXPECT_EQ(read(0xe0, 8), platform::unsupported);
    host.fail_call(1, failure::io);
    EXPECT_EQ(read(0xe1, 8), platform::simulated::io_failure);
    EXPECT_EQ(report.size(), 8U);
    host.fail_call(1, failure::nothing);
    EXPECT_EQ(read(0xe1, 8), platform::success);
    EXPECT_TRUE(report.empty());
    host.fail_call(1, failure::io);
    EXPECT_EQ(close(device), platform::simulated::io_failure);
}

TEST_F(hid_device, that_is_gone_cannot_be_made_but_still_be_closed) {
    EXPECT_FALSE(create_hid_device(first_match({{"IONameMatch", "bare"}})));
    EXPECT_FALSE(create_hid_device(platform::service()));
    const platform::service button = first_match({{"IONameMatch", "button"}});
    open(device);
    host.remove("button");
    EXPECT_FALSE(create_hid_device(button));
    EXPECT_EQ(read(0xe0, 8), platform::not_found);
    EXPECT_EQ(report.size(), 8U);
    EXPECT_EQ(open(device), platform::not_found);
    EXPECT_EQ(close(device), platform::success);
    const platform::hid_device none;
    EXPECT_EQ(open(none), platform::not_found);
    EXPECT_EQ(feature_report(none, 0xe0, report), platform::not_found);
    EXPECT_EQ(close(none), platform::bad_argument);
}

}  // namespace
