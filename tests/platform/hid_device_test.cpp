#include "platform/hid_device.h"

#include <array>
#include <memory>

#include "tests/support/device_test.h"

namespace tests {

namespace {

using platform::create_hid_device;

class hid_device : public device_test {
protected:
    hid_device() {
        unit->set_feature_report(0xe0, {0xe0, 1, 2});
        unit->set_feature_report(0xe1, {});
        host.add({.name = "button", .hid = unit});
        device = create_hid_device(service_named("button"));
    }

    // A report that can be read.
    byte_list read(std::uint8_t id, std::size_t room) {
        platform::byte_span report = platform::byte_span(buffer).first(room);
        EXPECT_EQ(feature_report(device, id, report), platform::success);
        return {report.begin(), report.end()};
    }
    // One that cannot: the room is left alone.
    void expect_failure(std::uint8_t id, std::size_t room, platform::return_code expected) {
        platform::byte_span report = platform::byte_span(buffer).first(room);
        EXPECT_EQ(feature_report(device, id, report), expected);
        EXPECT_EQ(report.size(), room);
    }

    std::shared_ptr<platform::simulated::hid_unit> unit =
        std::make_shared<platform::simulated::hid_unit>();
    platform::hid_device device;
    std::array<std::uint8_t, 8> buffer{};
};

TEST_F(hid_device, reads_feature_reports_between_open_and_close) {
    host.fail_call(1, failure::io);
    EXPECT_EQ(open(device), platform::simulated::io_failure);
    expect_failure(0xe0, 8, platform::bad_argument);
    EXPECT_EQ(close(device), platform::bad_argument);
    EXPECT_EQ(open(device), platform::success);
    EXPECT_EQ(read(0xe0, 3), (byte_list{0xe0, 1, 2}));
    EXPECT_EQ(read(0xe1, 8), byte_list());
    expect_failure(0xe0, 2, platform::bad_argument);
    expect_failure(0xe4, 8, platform::unsupported);
    unit->drop_feature_report(0xe0);
    expect_failure(0xe0, 8, platform::unsupported);
    host.fail_call(1, failure::io);
    expect_failure(0xe1, 8, platform::simulated::io_failure);
    host.fail_call(1, failure::io);
    EXPECT_EQ(close(device), platform::simulated::io_failure) << "but it is closed";
    EXPECT_EQ(close(device), platform::bad_argument);
    expect_failure(0xe1, 8, platform::bad_argument);
}

TEST_F(hid_device, that_is_gone_cannot_be_made_but_still_be_closed) {
    host.add({.name = "bare"});
    EXPECT_FALSE(create_hid_device(service_named("bare")));
    EXPECT_FALSE(create_hid_device({}));
    const platform::service button = service_named("button");
    open(device);
    host.remove("button");
    EXPECT_FALSE(create_hid_device(button));
    expect_failure(0xe0, 8, platform::not_found);
    EXPECT_EQ(open(device), platform::not_found);
    EXPECT_EQ(close(device), platform::success);
    device.reset();
    EXPECT_EQ(open(device), platform::not_found);
    expect_failure(0xe0, 8, platform::not_found);
    EXPECT_EQ(close(device), platform::bad_argument);
}

}  // namespace

}  // namespace tests
