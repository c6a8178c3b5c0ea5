#include "platform/registry.h"

#include <memory>

#include "tests/support/device_test.h"

namespace {

using platform::array;
using platform::dictionary;
using platform::first_child;
using platform::first_match;
using platform::matching_class;
using platform::property;
using platform::service;
using tests::interface_driver;

dictionary usage(std::int32_t page, std::int32_t code) {
    return {{"DeviceUsagePage", page}, {"DeviceUsage", code}};
}

dictionary with_usage(std::int32_t page, std::int32_t code) {
    return {{"DeviceUsagePairs", array{usage(page, code)}}};
}

// Two interface services, the second with a HID device below it.
class registry : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        host.add({.name = "accel",
                  .classes = {"interface", "base"},
                  .properties = {{"service_id", 7}, {"rate", 100}},
                  .unit = std::make_shared<interface_driver>()});
        const auto gyro = host.add({.name = "gyro",
                                    .classes = {"interface", "base"},
                                    .properties = {{"service_id", 8}, {"rate", 100}},
                                    .unit = std::make_shared<interface_driver>()});
        host.add({.name = "gyro-hid",
                  .classes = {"hid", "base"},
                  .properties = {{"LocationID", std::int64_t{8}},
                                 {"DeviceUsagePairs", array{usage(0x20, 0x76), usage(1, 2)}}},
                  .hid = std::make_shared<platform::simulated::hid_unit>()},
                 gyro);
    }

    static std::string matched(const dictionary& matching) {
        std::string name;
        return entry_name(first_match(matching), name) == platform::success ? name : "none";
    }
};

TEST_F(registry, the_first_match_in_registration_order_comes_back) {
    EXPECT_EQ(matched({}), "accel");
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"rate", 100}}}}), "accel");
    host.remove("accel");
    EXPECT_EQ(matched({}), "gyro");
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"rate", 100}}}}), "gyro");
}

TEST_F(registry, matches_an_entry_by_its_class_and_by_a_base_of_it) {
    EXPECT_EQ(matched(matching_class("interface")), "accel");
    EXPECT_EQ(matched(matching_class("hid")), "gyro-hid");
    EXPECT_EQ(matched(matching_class("base")), "accel");
    EXPECT_EQ(matched(matching_class("Interface")), "none");
    EXPECT_EQ(matched(matching_class("")), "none");
    EXPECT_EQ(matched({{"IOProviderClass", 1}}), "none");
}

TEST_F(registry, matches_an_entry_by_its_whole_name) {
    EXPECT_EQ(matched({{"IONameMatch", "gyro"}}), "gyro");
    EXPECT_EQ(matched({{"IONameMatch", "gyro-hid"}}), "gyro-hid");
    EXPECT_EQ(matched({{"IONameMatch", "gyr"}}), "none");
    EXPECT_EQ(matched({{"IONameMatch", 8}}), "none");
}

TEST_F(registry, matches_an_entry_by_all_of_the_given_properties) {
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"service_id", std::int64_t{8}}}}}), "gyro");
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"rate", 100}, {"service_id", 8}}}}), "gyro");
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"rate", 99}, {"service_id", 8}}}}), "none");
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"absent", 8}}}}), "none");
    EXPECT_EQ(matched({{"IOPropertyMatch", 8}}), "none");
}

TEST_F(registry, matches_a_device_by_location_and_by_any_usage_in_common) {
    EXPECT_EQ(matched({{"LocationID", 8}}), "gyro-hid");
    EXPECT_EQ(matched({{"LocationID", 7}}), "none");
    EXPECT_EQ(matched(with_usage(0x20, 0x76)), "gyro-hid");
    EXPECT_EQ(matched(with_usage(1, 2)), "gyro-hid");
    EXPECT_EQ(matched(with_usage(0x20, 2)), "none");
    EXPECT_EQ(matched({{"DeviceUsagePairs", array{usage(9, 9), usage(1, 2)}}}), "gyro-hid");
    EXPECT_EQ(matched({{"DeviceUsagePairs", array{}}}), "none");
    EXPECT_EQ(matched({{"DeviceUsagePairs", usage(1, 2)}}), "none");
}

TEST_F(registry, all_keys_must_match_and_an_unknown_one_matches_nothing) {
    dictionary matching = with_usage(1, 2);
    matching.set("IOProviderClass", "hid");
    EXPECT_EQ(matched(matching), "gyro-hid");
    matching.set("IOProviderClass", "interface");
    EXPECT_EQ(matched(matching), "none");
    EXPECT_EQ(matched({{"service_id", 7}}), "none");
    EXPECT_EQ(matched({{"IONameMatch", "gyro"}, {"Anything", 1}}), "none");
}

TEST_F(registry, the_first_child_that_is_there_comes_back_in_the_service_plane_only) {
    const auto gyro = host.find("gyro");
    host.add({.name = "second", .hid = gyro->children.front()->hid}, gyro);
    const service parent = first_match({{"IONameMatch", "gyro"}});
    std::string name;
    EXPECT_EQ(entry_name(first_child(parent, "IOService"), name), platform::success);
    EXPECT_EQ(name, "gyro-hid");
    EXPECT_FALSE(first_child(parent, "IOPower"));
    EXPECT_FALSE(first_child(first_child(parent, "IOService"), "IOService"));
    host.remove("gyro-hid");
    EXPECT_EQ(entry_name(first_child(parent, "IOService"), name), platform::success);
    EXPECT_EQ(name, "second");
    host.remove("gyro");
    EXPECT_FALSE(first_child(parent, "IOService"));
    EXPECT_FALSE(first_child(service(), "IOService"));
}

TEST_F(registry, an_entry_name_has_at_most_127_characters) {
    host.add({.name = std::string(127, 'x') + "yz", .classes = {"long"}});
    EXPECT_EQ(matched(matching_class("long")), std::string(127, 'x'));
}

TEST_F(registry, a_property_comes_back_as_a_copy) {
    const service gyro = first_match({{"IONameMatch", "gyro"}});
    const auto before = read_property(gyro, "rate");
    EXPECT_EQ(set_property(gyro, "rate", 50), platform::success);
    EXPECT_EQ(set_property(gyro, "new", "text"), platform::success);
    EXPECT_EQ(before->number(), 100);
    EXPECT_EQ(read_property(gyro, "rate")->number(), 50);
    EXPECT_EQ(*read_property(gyro, "new")->text(), "text");
    EXPECT_EQ(read_property(gyro, "absent"), std::nullopt);
    EXPECT_EQ(matched({{"IOPropertyMatch", dictionary{{"rate", 50}}}}), "gyro");
}

TEST_F(registry, an_entry_without_a_driver_takes_no_properties) {
    host.add({.name = "bare", .properties = {{"rate", 1}}});
    const service bare = first_match({{"IONameMatch", "bare"}});
    EXPECT_EQ(set_property(bare, "rate", 2), platform::unsupported);
    EXPECT_EQ(read_property(bare, "rate")->number(), 1);
}

TEST_F(registry, an_entry_that_is_gone_has_no_name_and_no_properties) {
    const service gyro = first_match({{"IONameMatch", "gyro"}});
    host.remove("gyro");
    for (const service* gone : {&gyro, static_cast<const service*>(nullptr)}) {
        const service none;
        const service& entry = gone != nullptr ? *gone : none;
        std::string name = "untouched";
        EXPECT_EQ(entry_name(entry, name), platform::not_found);
        EXPECT_EQ(name, "untouched");
        EXPECT_EQ(read_property(entry, "rate"), std::nullopt);
        EXPECT_EQ(set_property(entry, "rate", 1), platform::not_found);
    }
}

}  // namespace
