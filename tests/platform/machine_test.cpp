#include "platform/virtual/machine.h"

#include <array>
#include <memory>

#include "platform/connection.h"
#include "platform/hid_device.h"
#include "platform/registry.h"
#include "tests/support/device_test.h"

namespace {

using platform::dictionary;
using platform::first_match;
using platform::service;
using platform::simulated::all_failures;
using platform::simulated::code_of;
using platform::simulated::installed_machine;
using tests::failure;
using tests::interface_driver;
using tests::machine;

using lines = std::vector<std::string>;

const dictionary button{{"IONameMatch", "button"}};

// A service that is a HID device too, with a child.
void add_button(machine& host) {
    const auto driver = std::make_shared<interface_driver>();
    driver->set_report(0xd0, {1, 2, 3});
    const auto hid = std::make_shared<platform::simulated::hid_unit>();
    hid->set_feature_report(0xe0, {4});
    const auto entry =
        host.add({.name = "button", .properties = {{"service_id", 7}}, .unit = driver, .hid = hid});
    host.add({.name = "child", .unit = driver}, entry);
}

platform::return_code read_d0(const platform::connection& opened) {
    const std::array<std::uint64_t, 1> scalars{0xd0};
    std::array<std::uint8_t, 8> room{};
    platform::call_outputs outputs{{}, room};
    return call(opened, 2, {.scalars = scalars, .structure = {}}, outputs);
}

class virtual_machine : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        add_button(host);
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
    machine host;
    const installed_machine installed(host);
    add_button(host);
    open(create_hid_device(first_match(button)));
    EXPECT_EQ(host.open_handles(), 1U);
}

TEST_F(virtual_machine, logs_every_call_in_words) {
    {
        const service found = first_match(button);
        const service child = first_child(found, "IOService");
        std::string name;
        entry_name(found, name);
        read_property(found, "rate");
        set_property(found, "rate", platform::array{1, "x"});
        platform::connection opened;
        platform::open(child, 3, opened);
        platform::open(child, 0, opened);
        const std::array<std::uint64_t, 2> scalars{0, 0x1'0000'00d0};
        const std::array<std::uint8_t, 3> structure{0x00, 0x7f, 0xff};
        std::array<std::uint64_t, 1> results{};
        std::array<std::uint8_t, 8> room{};
        platform::call_outputs outputs{results, room};
        call(opened, 10, {.scalars = scalars, .structure = structure}, outputs);
    }
    EXPECT_EQ(
        host.log(),
        (lines{R"(first match {IONameMatch = "button"})", "first child of button", "name of button",
               "property of button rate", R"(set property of button rate = (1, "x"))",
               "open child type 3", "open child type 0",
               "call child 10 scalars [0x0 0x1000000d0] in [00 7f ff] results 1 room 8",
               "close child", "release child", "release button"}));
    EXPECT_EQ(host.calls_made(), 8U);
}

TEST_F(virtual_machine, logs_the_calls_on_hid_devices_and_on_nothing) {
    {
        const platform::hid_device device = create_hid_device(first_match(button));
        std::array<std::uint8_t, 4> room{};
        platform::byte_span report = room;
        open(device);
        feature_report(device, 0xe0, report);
        close(device);
        create_hid_device(service());
        close(platform::hid_device());
        read_d0({});
    }
    EXPECT_EQ(
        host.log(),
        (lines{R"(first match {IONameMatch = "button"})", "create hid device button",
               "release button", "open hid device button", "feature report of button 224 room 4",
               "close hid device button", "create hid device nothing", "close hid device nothing",
               "call nothing 2 scalars [0xd0] in [] results 0 room 8",
               "release hid device button"}));
}

TEST_F(virtual_machine, a_call_for_an_object_fails_without_one) {
    host.set_boot_time({1'700'000'000, 250'000});
    for (const failure how : all_failures) {
        const service found = first_match(button);
        host.fail_call(1, how);
        EXPECT_FALSE(first_match(button));
        host.fail_call(1, how);
        EXPECT_FALSE(first_child(found, "IOService"));
        host.fail_call(1, how);
        EXPECT_EQ(read_property(found, "service_id"), std::nullopt);
        host.fail_call(1, how);
        EXPECT_FALSE(create_hid_device(found));
        host.fail_call(1, how);
        EXPECT_EQ(platform::boot_time(), std::nullopt);
    }
}

TEST_F(virtual_machine, a_call_for_a_code_fails_with_the_one_that_was_named) {
    for (const failure how : all_failures) {
        const service found = first_match(button);
        platform::connection opened;
        host.fail_call(1, how);
        EXPECT_EQ(platform::open(found, 0, opened), code_of(how));
        EXPECT_FALSE(opened);
        platform::open(found, 0, opened);
        host.fail_call(1, how);
        EXPECT_EQ(read_d0(opened), code_of(how));

        std::string name = "before";
        host.fail_call(1, how);
        EXPECT_EQ(entry_name(found, name), code_of(how));
        EXPECT_EQ(name, how == failure::nothing ? "" : "before");
        host.fail_call(1, how);
        EXPECT_EQ(set_property(found, "service_id", 8), code_of(how));
        EXPECT_EQ(read_property(found, "service_id")->number(), 7);

        const platform::hid_device device = create_hid_device(found);
        std::array<std::uint8_t, 4> room{};
        platform::byte_span report = room;
        host.fail_call(1, how);
        EXPECT_EQ(open(device), code_of(how));
        EXPECT_EQ(feature_report(device, 0xe0, report), platform::bad_argument);
        open(device);
        host.fail_call(1, how);
        EXPECT_EQ(feature_report(device, 0xe0, report), code_of(how));
        EXPECT_EQ(report.size(), how == failure::nothing ? 0U : 4U);
        host.fail_call(1, how);
        EXPECT_EQ(close(device), code_of(how));
        EXPECT_EQ(close(device), platform::bad_argument);
    }
}

TEST_F(virtual_machine, fails_the_planned_calls_and_no_other) {
    host.fail_call(2, failure::io);
    host.fail_call(3, failure::io);
    EXPECT_TRUE(first_match(button));
    EXPECT_FALSE(first_match(button));
    EXPECT_FALSE(first_match(button));
    EXPECT_TRUE(first_match(button));
    host.fail_call(1, failure::io);
    EXPECT_FALSE(first_match(button));
    EXPECT_TRUE(first_match(button));
}

TEST_F(virtual_machine, runs_an_action_just_before_the_planned_call) {
    platform::connection opened;
    platform::open(first_match(button), 0, opened);
    host.before_call(2, [&] {
        host.remove("button");
        host.before_call(1, [&] { add_button(host); });
    });
    EXPECT_EQ(read_d0(opened), platform::success);
    EXPECT_EQ(read_d0(opened), platform::not_found);
    EXPECT_TRUE(first_match(button));
    EXPECT_EQ(read_d0(opened), platform::not_found);
}

TEST_F(virtual_machine, lets_an_action_borrow_what_it_likes_in_the_middle_of_a_call) {
    const service found = first_match(button);
    const platform::hid_device device = create_hid_device(found);
    std::vector<platform::hid_device> others;
    const auto borrow = [&] {
        for (int i = 0; i < 64; ++i)
            others.push_back(create_hid_device(found));
    };
    std::array<std::uint8_t, 4> room{};
    platform::byte_span report = room;
    host.before_call(1, borrow);
    EXPECT_EQ(open(device), platform::success);
    host.before_call(1, borrow);
    EXPECT_EQ(feature_report(device, 0xe0, report), platform::success);
    host.before_call(1, borrow);
    EXPECT_EQ(close(device), platform::success);
}

TEST_F(virtual_machine, tells_when_it_was_started_if_it_knows) {
    EXPECT_EQ(platform::boot_time(), std::nullopt);
    host.set_boot_time({1'700'000'000, 250'000});
    EXPECT_EQ(platform::boot_time()->seconds, 1'700'000'000);
    EXPECT_EQ(platform::boot_time()->microseconds, 250'000);
}

TEST_F(virtual_machine, takes_a_service_away_with_all_that_is_attached_to_it) {
    const auto child = host.find("child");
    host.add({.name = "grandchild"}, child);
    host.add({.name = "button"});
    host.remove("absent");
    host.remove("button");
    EXPECT_EQ(host.find("child"), nullptr);
    EXPECT_EQ(host.find("grandchild"), nullptr);
    EXPECT_EQ(host.find("button"), host.entries().back());
    EXPECT_EQ(host.entries().size(), 4U);
    EXPECT_EQ(host.entries()[1], child);
}

TEST_F(virtual_machine, is_the_one_that_was_installed_last) {
    machine inner;
    {
        const installed_machine installed(inner);
        EXPECT_EQ(&platform::simulated::current_machine(), &inner);
        EXPECT_FALSE(first_match(button));
    }
    EXPECT_EQ(&platform::simulated::current_machine(), &host);
    EXPECT_TRUE(first_match(button));
}

TEST(virtual_machine_alone, is_the_wrist_device_if_none_is_installed) {
    EXPECT_TRUE(first_match({{"IONameMatch", "WQR_wqr-button"}}));
    EXPECT_EQ(platform::simulated::current_machine().open_handles(), 0U);
}

}  // namespace
