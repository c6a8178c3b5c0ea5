#include "nrxctl/base/service_discovery.h"

#include "nrxctl/base/matching.h"
#include "tests/support/device_test.h"

namespace {

using tests::capture;
using tests::failure;
using tests::put_service;

constexpr const char* source = "nrxctl/base/service_discovery.cpp";

class service_discovery : public tests::device_test {
protected:
    // The registry name of the service that a name finds; empty if none.
    static std::string found(std::string_view name) {
        const platform::service service = nrx::find_service(name);
        std::string entry_name;
        if (service) platform::entry_name(service, entry_name);
        return entry_name;
    }

    void put_hid_device(std::string_view name, std::int32_t location) {
        host.add({.name = std::string(name),
                  .classes = {"KeltoNRXHIDDevice"},
                  .properties = {{"LocationID", location}}});
    }
};

TEST_F(service_discovery, finds_a_service_by_its_id_in_either_base) {
    put_service(host, "accel", 31);
    put_service(host, "gyro", 32);
    EXPECT_EQ(found("31"), "accel");
    EXPECT_EQ(found("0x1f"), "accel");
    EXPECT_EQ(found("0x20"), "gyro");
    EXPECT_EQ(found("0031"), "accel");
    EXPECT_EQ(found("33"), "");
}

TEST_F(service_discovery, takes_anything_but_digits_as_a_registry_name) {
    put_service(host, "accel", 31);
    put_service(host, "0X1f", 5);
    put_service(host, "-31", 6);
    EXPECT_EQ(found("0X1f"), "0X1f");
    EXPECT_EQ(found("-31"), "-31");
    EXPECT_EQ(found("Accel"), "");
}

TEST_F(service_discovery, prefers_the_prefixed_name) {
    put_service(host, "wqr-button", 1);
    put_service(host, "WQR_wqr-button", 2);
    EXPECT_EQ(found("wqr-button"), "WQR_wqr-button");
    host.remove("WQR_wqr-button");
    EXPECT_EQ(found("wqr-button"), "wqr-button");
}

TEST_F(service_discovery, sees_interface_services_only) {
    host.add({.name = "accel", .classes = {"Other"}, .properties = {{"service_id", 31}}});
    EXPECT_EQ(found("accel"), "");
    EXPECT_EQ(found("31"), "");
}

TEST_F(service_discovery, cuts_only_the_prefixed_name_at_127_characters) {
    const std::string name(200, 'n');
    const platform::service none = nrx::find_service(name);
    EXPECT_FALSE(none);
    EXPECT_EQ(host.log().at(0),
              "first match {IOProviderClass = \"KeltoNRXInterface\"; "
              "IONameMatch = \"WQR_" +
                  std::string(123, 'n') + "\"}");
    EXPECT_EQ(
        host.log().at(1),
        "first match {IOProviderClass = \"KeltoNRXInterface\"; IONameMatch = \"" + name + "\"}");
}

TEST_F(service_discovery, an_id_that_is_none_finds_nothing) {
    put_service(host, "zero", 0);
    for (const char* name :
         {"", "0x", "0xzz", "0x1z", "2147483648", "0xffffffff", "99999999999999999999", "0x-1"}) {
        std::int32_t id = 77;
        const auto result = capture([&] {
            EXPECT_EQ(found(name), "") << name;
            EXPECT_FALSE(nrx::find_hid_device(name)) << name;
            EXPECT_FALSE(nrx::resolve_service_id(name, id)) << name;
        });
        EXPECT_EQ(result.err, "") << name;
        EXPECT_EQ(id, 77);
    }
    EXPECT_EQ(found("0"), "zero");
    EXPECT_EQ(found("0x0"), "zero");
}

TEST_F(service_discovery, says_when_a_service_does_not_exist) {
    put_service(host, "accel", 31);
    EXPECT_EQ(capture([] { EXPECT_TRUE(nrx::service_exists("accel")); }).out, "");
    const auto result = capture([] { EXPECT_FALSE(nrx::service_exists("nope")); });
    EXPECT_EQ(result.out, "Service nope can't be found\n");
    EXPECT_EQ(result.err, "");
}

TEST_F(service_discovery, finds_the_hid_device_at_the_service_id) {
    put_service(host, "WQR_button", 9);
    put_hid_device("other", 8);
    put_hid_device("button", 9);
    for (const char* name : {"button", "9", "0x9"}) {
        const platform::service device = nrx::find_hid_device(name);
        std::string entry_name;
        ASSERT_EQ(platform::entry_name(device, entry_name), platform::success) << name;
        EXPECT_EQ(entry_name, "button") << name;
    }
    EXPECT_FALSE(nrx::find_hid_device("10"));
}

TEST_F(service_discovery, reports_a_missing_interface_of_a_hid_device) {
    const auto result = capture([] { EXPECT_FALSE(nrx::find_hid_device("button")); });
    EXPECT_EQ(result.err, tests::failure_line("nrxtoollib", "nrx_interface", source));
}

TEST_F(service_discovery, an_interface_without_an_id_has_neither_hid_device_nor_id) {
    host.add({.name = "bare", .classes = {"KeltoNRXInterface"}});
    put_hid_device("zero", 0);
    std::int32_t id = 77;
    const auto result = capture([&] {
        EXPECT_FALSE(nrx::find_hid_device("bare"));
        EXPECT_FALSE(nrx::resolve_service_id("bare", id));
    });
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(id, 77);
}

TEST_F(service_discovery, resolves_numbers_without_asking_and_names_by_their_service) {
    put_service(host, "accel", -4);
    std::int32_t id = 0;
    EXPECT_TRUE(nrx::resolve_service_id("0x7fffffff", id));
    EXPECT_EQ(id, 2147483647);
    EXPECT_TRUE(nrx::resolve_service_id("12", id));
    EXPECT_EQ(id, 12);
    EXPECT_EQ(host.calls_made(), 0U);
    EXPECT_TRUE(nrx::resolve_service_id("accel", id));
    EXPECT_EQ(id, -4);
    const auto result = capture([&] { EXPECT_FALSE(nrx::resolve_service_id("nope", id)); });
    EXPECT_EQ(result.err,
              tests::failure_line("nrxtoollib", "service != ((io_object_t) 0)", source));
}

TEST_F(service_discovery, names_the_service_of_an_id) {
    put_service(host, "accel", 31);
    std::string name = "untouched";
    put_service(host, "below", -4);
    EXPECT_TRUE(nrx::service_name_for_id(31, name));
    EXPECT_EQ(name, "accel");
    EXPECT_TRUE(nrx::service_name_for_id(-4, name));
    EXPECT_EQ(name, "below");

    name = "untouched";
    const auto missing = capture([&] { EXPECT_FALSE(nrx::service_name_for_id(5, name)); });
    EXPECT_EQ(missing.err,
              tests::failure_line("nrxtoollib", "service != ((io_object_t) 0)", source));
    host.fail_call(2, failure::io);
    const auto nameless = capture([&] { EXPECT_FALSE(nrx::service_name_for_id(31, name)); });
    EXPECT_EQ(nameless.err, tests::failure_line("nrxtoollib", "kr == 0 ", source,
                                                "device i/o failure (0xe0000401)"));
    EXPECT_EQ(name, "untouched");
}

TEST(matching, builds_what_the_lookups_are_made_with) {
    EXPECT_EQ(platform::describe(nrx::match_service_id(31)),
              "{IOProviderClass = \"KeltoNRXInterface\"; IOPropertyMatch = {service_id = 31}}");
    EXPECT_EQ(platform::describe(nrx::match_usage_pairs({nrx::usage_pair(0xFF00, 0x20)})),
              "{DeviceUsagePairs = ({DeviceUsagePage = 65280; DeviceUsage = 32})}");
}

}  // namespace
