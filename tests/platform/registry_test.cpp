#include "platform/registry.h"

#include <memory>

#include "tests/support/device_test.h"

namespace tests {

namespace {

using platform::array;
using platform::dictionary;
using platform::first_child;
using platform::matching_class;
using platform::property;
using platform::service;

dictionary usage(std::int32_t page, std::int32_t code) {
    return {{"DeviceUsagePage", page}, {"DeviceUsage", code}};
}

dictionary with_usage(std::int32_t page, std::int32_t code) {
    return {{"DeviceUsagePairs", array{usage(page, code)}}};
}

dictionary usage_and_class(std::string_view class_name) {
    dictionary both = with_usage(1, 2);
    both.set("IOProviderClass", class_name);
    return both;
}

dictionary with(const property& properties) {
    return {{"IOPropertyMatch", properties}};
}

// Two interface services, the second with a HID device below it.
class registry : public device_test {
protected:
    registry() {
        put("accel", 7);
        host.add({.name = "gyro-hid",
                  .classes = {"hid", "base"},
                  .properties = {{"LocationID", std::int64_t{8}},
                                 {"DeviceUsagePairs", array{usage(0x20, 0x76), usage(1, 2)}}},
                  .hid = std::make_shared<platform::simulated::hid_unit>()},
                 put("gyro", 8));
    }

    platform::simulated::entry_ref put(const char* name, std::int32_t id) {
        return host.add({.name = name,
                         .classes = {"interface", "base"},
                         .properties = {{"service_id", id}, {"rate", 100}},
                         .unit = std::make_shared<interface_driver>()});
    }

    static std::string matched(const dictionary& matching) {
        return name_of(platform::first_match(matching));
    }
    static std::string name_of(const service& entry) {
        std::string name;
        return platform::entry_name(entry, name) == platform::success ? name : "none";
    }
};

TEST_F(registry, the_first_match_in_registration_order_comes_back_and_names_have_127_characters) {
    EXPECT_EQ(matched({}), "accel");
    EXPECT_EQ(matched(with(dictionary{{"rate", 100}})), "accel");
    host.remove("accel");
    EXPECT_EQ(matched({}), "gyro");
    EXPECT_EQ(matched(matching_class("base")), "gyro");
    host.add({.name = std::string(127, 'x') + "yz", .classes = {"long"}});
    EXPECT_EQ(matched(matching_class("long")), std::string(127, 'x'));
}

TEST_F(registry, an_entry_matches_if_every_key_holds) {
    const std::vector<std::pair<dictionary, std::string>> rows{
        // class, or a base of it
        {matching_class("interface"), "accel"},
        {matching_class("hid"), "gyro-hid"},
        {matching_class("base"), "accel"},
        {matching_class("Interface"), "none"},
        {{{"IOProviderClass", 1}}, "none"},
        // whole name
        {{{"IONameMatch", "gyro"}}, "gyro"},
        {{{"IONameMatch", "gyr"}}, "none"},
        {{{"IONameMatch", 8}}, "none"},
        // all properties
        {with(dictionary{{"service_id", std::int64_t{8}}}), "gyro"},
        {with(dictionary{{"rate", 100}, {"service_id", 8}}), "gyro"},
        {with(dictionary{{"rate", 99}, {"service_id", 8}}), "none"},
        {with(dictionary{{"absent", 8}}), "none"},
        {with(8), "none"},
        // location, and any usage in common
        {{{"LocationID", 8}}, "gyro-hid"},
        {{{"LocationID", 7}}, "none"},
        {with_usage(0x20, 0x76), "gyro-hid"},
        {with_usage(1, 2), "gyro-hid"},
        {with_usage(0x20, 2), "none"},
        {{{"DeviceUsagePairs", array{usage(9, 9), usage(1, 2)}}}, "gyro-hid"},
        {{{"DeviceUsagePairs", array{}}}, "none"},
        {{{"DeviceUsagePairs", usage(1, 2)}}, "none"},
        // more than one key, and unknown ones
        {usage_and_class("hid"), "gyro-hid"},
        {usage_and_class("interface"), "none"},
        {{{"service_id", 7}}, "none"},
        {{{"IONameMatch", "gyro"}, {"Anything", 1}}, "none"},
    };
    for (const auto& [matching, name] : rows)
        EXPECT_EQ(matched(matching), name) << platform::describe(matching);
}

TEST_F(registry, the_first_child_that_is_there_comes_back_in_the_service_plane_only) {
    const auto gyro = host.find("gyro");
    host.add({.name = "second", .hid = gyro->children.front()->hid}, gyro);
    const service parent = service_named("gyro");
    EXPECT_EQ(name_of(first_child(parent, "IOService")), "gyro-hid");
    EXPECT_FALSE(first_child(parent, "IOPower"));
    EXPECT_FALSE(first_child(first_child(parent, "IOService"), "IOService"));
    host.remove("gyro-hid");
    EXPECT_EQ(name_of(first_child(parent, "IOService")), "second");
    host.remove("gyro");
    EXPECT_FALSE(first_child(parent, "IOService"));
    EXPECT_FALSE(first_child(service(), "IOService"));
}

TEST_F(registry, a_property_comes_back_as_a_copy) {
    const service gyro = service_named("gyro");
    const auto before = read_property(gyro, "rate");
    EXPECT_EQ(set_property(gyro, "rate", 50), platform::success);
    EXPECT_EQ(set_property(gyro, "new", "text"), platform::success);
    EXPECT_EQ(before->number(), 100);
    EXPECT_EQ(read_property(gyro, "rate")->number(), 50);
    EXPECT_EQ(*read_property(gyro, "new")->text(), "text");
    EXPECT_EQ(read_property(gyro, "absent"), std::nullopt);
    // An entry without a driver takes none.
    host.add({.name = "bare", .properties = {{"rate", 1}}});
    const service bare = service_named("bare");
    EXPECT_EQ(set_property(bare, "rate", 2), platform::unsupported);
}

TEST_F(registry, an_entry_that_is_gone_has_no_name_and_no_properties) {
    const service gyro = service_named("gyro");
    const service none;
    host.remove("gyro");
    for (const service* entry : {&gyro, &none}) {
        std::string name = "untouched";
        EXPECT_EQ(entry_name(*entry, name), platform::not_found);
        EXPECT_EQ(name, "untouched");
        EXPECT_EQ(read_property(*entry, "rate"), std::nullopt);
        EXPECT_EQ(set_property(*entry, "rate", 1), platform::not_found);
    }
}

}  // namespace

}  // namespace tests
