#include "nrxctl/base/service_discovery.h"

#include "nrxctl/base/matching.h"
#include "tests/support/device_test.h"

namespace tests {

namespace {

constexpr const char* file = "base/service_discovery.cpp";

class service_discovery : public device_test {
protected:
    // The registry name of what was found; empty if nothing was.
    static std::string name_of(const platform::service& service) {
        std::string name;
        if (service) platform::entry_name(service, name);
        return name;
    }
    static std::string found(std::string_view name) { return name_of(nrx::find_service(name)); }

    void put_hid_device(std::string_view name, std::int32_t location) {
        host.add({.name = std::string(name),
                  .classes = {"KeltoNRXHIDDevice"},
                  .properties = {{"LocationID", location}}});
    }
};

TEST_F(service_discovery, finds_a_service_by_its_id_and_takes_anything_but_digits_as_a_name) {
    host.add({.name = "no interface", .classes = {"Other"}, .properties = {{"service_id", 31}}});
    put_service(host, "zero", 0);
    put_service(host, "accel", 31);
    put_service(host, "gyro", 32);
    put_service(host, "0X1f", 5);
    put_service(host, "-31", 6);
    const std::vector<std::pair<const char*, const char*>> rows{
        {"31", "accel"}, {"0x1f", "accel"}, {"0x20", "gyro"},     {"0031", "accel"},
        {"33", ""},      {"0X1f", "0X1f"},  {"-31", "-31"},       {"Accel", ""},
        {"0", "zero"},   {"0x0", "zero"},   {"no interface", ""},
    };
    for (const auto& [name, service] : rows)
        EXPECT_EQ(found(name), service) << name;
}

TEST_F(service_discovery, prefers_the_prefixed_name_and_cuts_it_alone_at_127_characters) {
    put_service(host, "wqr-button", 1);
    put_service(host, "WQR_wqr-button", 2);
    EXPECT_EQ(found("wqr-button"), "WQR_wqr-button");
    host.remove("WQR_wqr-button");
    EXPECT_EQ(found("wqr-button"), "wqr-button");
    const std::string name(200, 'n');
    EXPECT_EQ(found(name), "");
    const auto asked = [](const std::string& wanted) {
        return "first match {IOProviderClass = \"KeltoNRXInterface\"; IONameMatch = \"" + wanted +
               "\"}";
    };
    EXPECT_EQ(host.log().end()[-2], asked("WQR_" + std::string(123, 'n')));
    EXPECT_EQ(host.log().back(), asked(name));
}

TEST_F(service_discovery, an_id_that_is_none_finds_nothing_and_what_is_not_found_is_said) {
    put_service(host, "zero", 0);
    for (const char* name :
         {"", "0x", "0xzz", "0x1z", "2147483648", "0xffffffff", "99999999999999999999", "0x-1"}) {
        std::int32_t id = 77;
        const auto result = capture([&] {
            EXPECT_EQ(found(name), "") << name;
            EXPECT_FALSE(nrx::find_hid_device(name)) << name;
            EXPECT_FALSE(nrx::resolve_service_id(name, id)) << name;
            EXPECT_FALSE(nrx::service_exists(name));
            EXPECT_TRUE(nrx::service_exists("zero"));
        });
        EXPECT_EQ(result.out, "Service " + std::string(name) + " can't be found\n");
        EXPECT_EQ(result.err, "") << name;
        EXPECT_EQ(id, 77);
    }
}

TEST_F(service_discovery, finds_the_hid_device_at_the_service_id) {
    put_hid_device("zero", 0);
    put_hid_device("button", 9);
    EXPECT_EQ(capture([] { EXPECT_FALSE(nrx::find_hid_device("button")); }).err,
              failed(file, "nrx_interface"));
    put_service(host, "WQR_button", 9);
    for (const char* name : {"button", "9", "0x9"})
        EXPECT_EQ(name_of(nrx::find_hid_device(name)), "button") << name;
    EXPECT_FALSE(nrx::find_hid_device("10"));
    host.add({.name = "bare", .classes = {"KeltoNRXInterface"}});
    std::int32_t id = 77;
    const auto without_id = capture([&] {
        EXPECT_FALSE(nrx::find_hid_device("bare"));
        EXPECT_FALSE(nrx::resolve_service_id("bare", id));
    });
    EXPECT_EQ(without_id.err, "");
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
    EXPECT_EQ(capture([&] { EXPECT_FALSE(nrx::resolve_service_id("nope", id)); }).err,
              failed(file, "service != ((io_object_t) 0)"));
}

TEST_F(service_discovery, names_the_service_of_an_id) {
    put_service(host, "accel", 31);
    put_service(host, "below", -4);
    std::string name;
    EXPECT_TRUE(nrx::service_name_for_id(31, name));
    EXPECT_EQ(name, "accel");
    EXPECT_TRUE(nrx::service_name_for_id(-4, name));
    EXPECT_EQ(name, "below");
    EXPECT_EQ(capture([&] { EXPECT_FALSE(nrx::service_name_for_id(5, name)); }).err,
              failed(file, "service != ((io_object_t) 0)"));
    host.fail_call(2, failure::io);
    EXPECT_EQ(capture([&] { EXPECT_FALSE(nrx::service_name_for_id(31, name)); }).err,
              failed(file, "kr == 0 ", io_text));
    EXPECT_EQ(name, "below");
}

TEST(matching, builds_what_the_lookups_are_made_with) {
    EXPECT_EQ(platform::describe(nrx::match_service_id(31)),
              "{IOProviderClass = \"KeltoNRXInterface\"; IOPropertyMatch = {service_id = 31}}");
    EXPECT_EQ(platform::describe(nrx::match_usage_pairs({nrx::usage_pair(0xFF00, 0x20)})),
              "{DeviceUsagePairs = ({DeviceUsagePage = 65280; DeviceUsage = 32})}");
}

}  // namespace

}  // namespace tests
