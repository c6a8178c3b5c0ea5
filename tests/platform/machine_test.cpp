// What the virtual host counts and how it lets services go; its faults and actions are proved by
// the tests that use them.
#include "platform/virtual/machine.h"

#include <array>
#include <memory>

#include "platform/connection.h"
#include "platform/hid_device.h"
#include "platform/registry.h"
#include "tests/support/device_test.h"

namespace {

using platform::first_match;
using platform::service;

const platform::dictionary button{{"IONameMatch", "button"}};

// Puts a service that is a HID device too, with a child.
void put_button(tests::machine& host) {
    const auto driver = std::make_shared<tests::interface_driver>();
    const auto hid = std::make_shared<platform::simulated::hid_unit>();
    hid->set_feature_report(0xe0, {4});
    host.add({.name = "child", .unit = driver},
             host.add({.name = "button", .unit = driver, .hid = hid}));
}

class virtual_machine : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        put_button(host);
    }
};

TEST_F(virtual_machine, counts_every_handle_that_is_out) {
    service found = first_match(button);
    EXPECT_EQ(host.open_handles(), 1U);
    service child = first_child(found, "IOService");
    platform::connection opened;
    platform::open(child, 0, opened);
    platform::hid_device device = create_hid_device(found);
    EXPECT_EQ(host.open_handles(), 4U);
    open(device);
    open(device);
    EXPECT_EQ(host.open_handles(), 5U);
    close(device);
    device.reset();
    found.reset();
    EXPECT_EQ(host.open_handles(), 2U);
    child = service();
    opened = platform::connection();
    EXPECT_EQ(host.open_handles(), 0U);
}

TEST(virtual_machine_alone, remembers_a_device_that_was_released_before_it_was_closed) {
    tests::machine host;
    const platform::simulated::installed_machine installed(host);
    put_button(host);
    open(create_hid_device(first_match(button)));
    EXPECT_EQ(host.open_handles(), 1U);
}

TEST_F(virtual_machine, lets_an_action_borrow_what_it_likes_in_the_middle_of_a_call) {
    const service found = first_match(button);
    const platform::hid_device device = create_hid_device(found);
    std::vector<platform::hid_device> others;
    for (std::size_t call = 1; call <= 3; ++call) {
        host.before_call(call + 64 * (call - 1), [&] {
            for (int i = 0; i < 64; ++i)
                others.push_back(create_hid_device(found));
        });
    }
    std::array<std::uint8_t, 4> room{};
    platform::byte_span report = room;
    EXPECT_EQ(open(device), platform::success);
    EXPECT_EQ(feature_report(device, 0xe0, report), platform::success);
    EXPECT_EQ(close(device), platform::success);
    EXPECT_EQ(others.size(), 3U * 64U);
}

TEST_F(virtual_machine, takes_a_service_away_with_all_that_is_attached_to_it) {
    host.add({.name = "grandchild"}, host.find("child"));
    host.add({.name = "button"});
    host.remove("absent");
    host.remove("button");
    EXPECT_EQ(host.find("child"), nullptr);
    EXPECT_EQ(host.find("grandchild"), nullptr);
    EXPECT_EQ(host.find("button"), host.entries().back());
}

TEST_F(virtual_machine, is_the_one_that_was_installed_last) {
    {
        tests::machine inner;
        const platform::simulated::installed_machine installed(inner);
        EXPECT_FALSE(first_match(button));
    }
    EXPECT_TRUE(first_match(button));
}

}  // namespace
