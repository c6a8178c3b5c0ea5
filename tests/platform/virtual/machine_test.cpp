// What the virtual host counts and how it lets services go; its faults and actions are proved by
// the tests that use them.
#include "platform/virtual/machine.h"

#include "platform/connection.h"
#include "platform/hid_device.h"
#include "tests/support/device_test.h"

namespace tests {

namespace {

class virtual_machine : public device_test {
protected:
    // A service that is a HID device too, with a child.
    virtual_machine() {
        const auto driver = std::make_shared<interface_driver>();
        const auto hid = std::make_shared<platform::simulated::hid_unit>();
        host.add({.name = "child", .unit = driver},
                 host.add({.name = "button", .unit = driver, .hid = hid}));
    }
};

TEST_F(virtual_machine, counts_every_handle_that_is_out_and_devices_left_open) {
    machine inner;
    {
        const platform::service found = service_named("button");
        const platform::service child = first_child(found, "IOService");
        platform::connection opened;
        platform::open(child, 0, opened);
        const platform::hid_device device = create_hid_device(found);
        EXPECT_EQ(host.open_handles(), 4U);
        open(device);
        open(device);
        EXPECT_EQ(host.open_handles(), 5U);
        close(device);
        const platform::simulated::installed_machine installed(inner);
        EXPECT_FALSE(service_named("button")) << "the machine installed last is asked";
        inner.add({.name = "other", .hid = std::make_shared<platform::simulated::hid_unit>()});
        open(create_hid_device(service_named("other")));
    }
    EXPECT_EQ(host.open_handles(), 0U);
    EXPECT_EQ(inner.open_handles(), 1U) << "released before it was closed";
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

}  // namespace

}  // namespace tests
