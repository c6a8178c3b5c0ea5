// The contract of the registry, and of entries that are removed.

#include "platform/registry.h"

#include <memory>

#include "tests/support/device_test.h"

namespace tests {

using namespace platform;

namespace {

dictionary usage(std::int32_t page, std::int32_t code) {
    return {{"DeviceUsagePage", page}, {"DeviceUsage", code}};
}

dictionary with_usages(const property& pairs) {
    return {{"DeviceUsagePairs", pairs}};
}

dictionary with_properties(const property& properties) {
    return {{"IOPropertyMatch", properties}};
}

// Two interface services, the second of which has a HID device as its child.
class registry_entries : public device_test {
protected:
    registry_entries() {
        add("accel", 7);
        host.add({.name = "gyro-hid",
                  .classes = {"hid", "base"},
                  .properties = {{"LocationID", std::int64_t{8}},
                                 {"DeviceUsagePairs", array{usage(0x20, 0x76), usage(1, 2)}}},
                  .hid = std::make_shared<simulated::virtual_hid_device>()},
                 add("gyro", 8));
    }

    simulated::entry_ref add(const char* name, std::int32_t id) {
        return host.add({.name = name,
                         .classes = {"interface", "base"},
                         .properties = {{"service_id", id}, {"rate", 100}},
                         .driver = std::make_shared<interface_driver>()});
    }

    static std::string name_of(const service& entry) {
        std::string name = "none";
        entry_name(entry, name);
        return name;
    }
};

TEST_F(registry_entries, match_by_every_key) {
    const std::vector<std::pair<dictionary, std::string>> cases{
        {dictionary{}, "accel"},
        // Class or base class.
        {matching_class("interface"), "accel"},
        {matching_class("base"), "accel"},
        {matching_class("Interface"), "none"},
        {{{"IOProviderClass", 1}}, "none"},
        // Whole name.
        {{{"IONameMatch", "gyro"}}, "gyro"},
        {{{"IONameMatch", "gyr"}}, "none"},
        {{{"IONameMatch", 8}}, "none"},
        // All properties.
        {with_properties(dictionary{{"rate", 100}}), "accel"},
        {with_properties(dictionary{{"service_id", std::int64_t{8}}}), "gyro"},
        {with_properties(dictionary{{"rate", 100}, {"service_id", 8}}), "gyro"},
        {with_properties(dictionary{{"rate", 99}, {"service_id", 8}}), "none"},
        {with_properties(dictionary{{"absent", 8}}), "none"},
        {with_properties(8), "none"},
        // Location, and any common usage pair.
        {{{"LocationID", 8}}, "gyro-hid"},
        {{{"LocationID", 7}}, "none"},
        {with_usages(array{usage(0x20, 0x76)}), "gyro-hid"},
        {with_usages(array{usage(1, 2)}), "gyro-hid"},
        {with_usages(array{usage(0x20, 2)}), "none"},
        {with_usages(array{usage(9, 9), usage(1, 2)}), "gyro-hid"},
        {with_usages(array{}), "none"},
        {with_usages(usage(1, 2)), "none"},
        // Several keys, and unknown keys.
        {{{"IOProviderClass", "hid"}, {"LocationID", 8}}, "gyro-hid"},
        {{{"IOProviderClass", "interface"}, {"LocationID", 8}}, "none"},
        {{{"service_id", 7}}, "none"},
        {{{"IONameMatch", "gyro"}, {"Anything", 1}}, "none"},
    };
    for (const auto& [matching, name] : cases)
        EXPECT_EQ(name_of(first_match(matching)), name) << describe(matching);
}

TEST_F(registry_entries, are_all_found_unless_the_look_up_fails) {
    std::vector<service> services(1);
    host.fail_call(1, failure::io);
    EXPECT_EQ(all_matches(matching_class("base"), services), simulated::io_failure);
    EXPECT_EQ(services.size(), 1U);
    EXPECT_EQ(all_matches(matching_class("base"), services), success);
    ASSERT_EQ(services.size(), 3U);
    EXPECT_EQ(name_of(services[0]) + name_of(services[1]) + name_of(services[2]),
              "accelgyrogyro-hid");
    host.add({.name = std::string(127, 'x') + "yz", .classes = {"long"}});
    EXPECT_EQ(all_matches(matching_class("long"), services), success);
    EXPECT_EQ(name_of(services.at(0)), std::string(127, 'x')) << "names are cut";
    EXPECT_EQ(all_matches(matching_class("absent"), services), success);
    EXPECT_TRUE(services.empty());
}

TEST_F(registry_entries, copy_properties_and_need_a_driver_to_set_them) {
    const service gyro = service_named("gyro");
    const auto before = read_property(gyro, "rate");
    EXPECT_EQ(set_property(gyro, "rate", 50), success);
    EXPECT_EQ(set_property(gyro, "new", "text"), success);
    EXPECT_EQ(before->number(), 100);
    EXPECT_EQ(read_property(gyro, "rate")->number(), 50);
    EXPECT_EQ(*read_property(gyro, "new")->text(), "text");
    EXPECT_EQ(read_property(gyro, "absent"), std::nullopt);
    property value("unchanged");
    EXPECT_FALSE(read_property(gyro, "absent", value));
    EXPECT_EQ(*value.text(), "unchanged");
    host.add({.name = "bare"});
    EXPECT_EQ(set_property(service_named("bare"), "rate", 2), unsupported);
}

TEST_F(registry_entries, are_removed_with_everything_attached) {
    const service gyro = service_named("gyro");
    host.add({.name = "grandchild"}, host.find("gyro-hid"));
    host.add({.name = "gyro"});
    host.remove("absent");
    host.remove("gyro");
    EXPECT_EQ(host.find("gyro-hid"), nullptr);
    EXPECT_EQ(host.find("grandchild"), nullptr);
    EXPECT_FALSE(service_named("grandchild"));
    EXPECT_EQ(host.find("gyro"), host.entries().back());
    const service none;
    for (const service* entry : {&gyro, &none}) {
        EXPECT_EQ(name_of(*entry), "none");
        EXPECT_FALSE(first_child(*entry, "IOService"));
        EXPECT_EQ(read_property(*entry, "rate"), std::nullopt);
        EXPECT_EQ(set_property(*entry, "rate", 1), not_found);
        std::string name;
        EXPECT_EQ(entry_name(*entry, name), not_found);
    }
}

}  // namespace

}  // namespace tests
