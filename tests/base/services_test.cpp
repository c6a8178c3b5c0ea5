#include "nrxctl/base/services.h"

#include "tests/support/device_test.h"

namespace tests {

namespace {

constexpr const char* file = source_file::services;

class services : public device_test {
protected:
    // The registry name of a service; empty for an empty handle.
    static std::string name_of(const platform::service& service) {
        std::string name;
        if (service) platform::entry_name(service, name);
        return name;
    }
    static std::string find(std::string_view name) { return name_of(nrx::find_service(name)); }

    void add_hid_device(std::string_view name, std::int32_t location) {
        host.add({.name = std::string(name),
                  .classes = {"KeltoNRXHIDDevice"},
                  .properties = {{"LocationID", location}}});
    }
};

TEST_F(services, are_found_by_id_or_by_name) {
    host.add({.name = "no interface", .classes = {"Other"}, .properties = {{"service_id", 31}}});
    add_service(host, "zero", 0);
    add_service(host, "accel", 31);
    add_service(host, "gyro", 32);
    add_service(host, "0X1f", 5);
    add_service(host, "-31", 6);
    const std::vector<std::pair<const char*, const char*>> rows{
        {"31", "accel"}, {"0x1f", "accel"}, {"0x20", "gyro"},     {"0031", "accel"},
        {"33", ""},      {"0X1f", "0X1f"},  {"-31", "-31"},       {"Accel", ""},
        {"0", "zero"},   {"0x0", "zero"},   {"no interface", ""},
    };
    for (const auto& [name, service] : rows)
        EXPECT_EQ(find(name), service) << name;
}

TEST_F(services, prefixed_name_is_tried_first_and_cut_at_127) {
    add_service(host, "wqr-button", 1);
    add_service(host, "WQR_wqr-button", 2);
    EXPECT_EQ(find("wqr-button"), "WQR_wqr-button");
    host.remove("WQR_wqr-button");
    EXPECT_EQ(find("wqr-button"), "wqr-button");
    const std::string name(200, 'n');
    EXPECT_EQ(find(name), "");
    const auto lookup = [](const std::string& wanted) {
        return "first match {IOProviderClass = \"KeltoNRXInterface\"; IONameMatch = \"" + wanted +
               "\"}";
    };
    EXPECT_EQ(host.log().end()[-2], lookup("WQR_" + std::string(123, 'n')));
    EXPECT_EQ(host.log().back(), lookup(name));
}

TEST_F(services, invalid_id_matches_nothing) {
    add_service(host, "zero", 0);
    for (const char* name :
         {"", "0x", "0xzz", "0x1z", "2147483648", "0xffffffff", "99999999999999999999", "0x-1"}) {
        nrx::service_id id = 77;
        const auto result = capture([&] {
            EXPECT_EQ(find(name), "") << name;
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

TEST_F(services, hid_device_is_found_at_the_service_id) {
    add_hid_device("zero", 0);
    add_hid_device("button", 9);
    EXPECT_EQ(capture([] { EXPECT_FALSE(nrx::find_hid_device("button")); }).err,
              library_report(file, "nrx_interface"));
    add_service(host, "WQR_button", 9);
    for (const char* name : {"button", "9", "0x9"})
        EXPECT_EQ(name_of(nrx::find_hid_device(name)), "button") << name;
    EXPECT_FALSE(nrx::find_hid_device("10"));
    host.add({.name = "bare", .classes = {"KeltoNRXInterface"}});
    nrx::service_id id = 77;
    const auto without_id = capture([&] {
        EXPECT_FALSE(nrx::find_hid_device("bare"));
        EXPECT_FALSE(nrx::resolve_service_id("bare", id));
    });
    EXPECT_EQ(without_id.err, "");
    EXPECT_EQ(id, 77);
}

TEST_F(services, ids_are_resolved_from_numbers_and_names) {
    add_service(host, "accel", -4);
    nrx::service_id id = 0;
    EXPECT_TRUE(nrx::resolve_service_id("0x7fffffff", id));
    EXPECT_EQ(id, 2147483647);
    EXPECT_TRUE(nrx::resolve_service_id("12", id));
    EXPECT_EQ(id, 12);
    EXPECT_EQ(host.calls_made(), 0U);
    EXPECT_TRUE(nrx::resolve_service_id("accel", id));
    EXPECT_EQ(id, -4);
    add_service(host, "lowest", INT32_MIN);
    EXPECT_TRUE(nrx::resolve_service_id("lowest", id));
    EXPECT_EQ(id, INT32_MIN);
    for (const std::int64_t beyond : {std::int64_t{INT32_MIN} - 1, std::int64_t{INT32_MAX} + 1}) {
        const platform::property value(beyond);
        EXPECT_EQ(nrx::set_service_property(service_named("accel"), "service_id", &value),
                  platform::success);
        EXPECT_FALSE(nrx::resolve_service_id("accel", id));
        EXPECT_EQ(id, INT32_MIN);
    }
    EXPECT_EQ(capture([&] { EXPECT_FALSE(nrx::resolve_service_id("nope", id)); }).err,
              library_report(file, "service != ((io_object_t) 0)"));
}

TEST_F(services, name_is_found_by_id) {
    add_service(host, "accel", 31);
    add_service(host, "below", -4);
    std::string name;
    EXPECT_TRUE(nrx::service_name_for_id(31, name));
    EXPECT_EQ(name, "accel");
    EXPECT_TRUE(nrx::service_name_for_id(-4, name));
    EXPECT_EQ(name, "below");
    EXPECT_EQ(capture([&] { EXPECT_FALSE(nrx::service_name_for_id(5, name)); }).err,
              library_report(file, "service != ((io_object_t) 0)"));
    host.fail_call(2, failure::io);
    EXPECT_EQ(capture([&] { EXPECT_FALSE(nrx::service_name_for_id(31, name)); }).err,
              library_report(file, "kr == 0 ", io_text));
    EXPECT_EQ(name, "below");
}

TEST(matching, dictionaries_describe_the_lookup) {
    EXPECT_EQ(platform::describe(nrx::match_service_id(31)),
              "{IOProviderClass = \"KeltoNRXInterface\"; IOPropertyMatch = {service_id = 31}}");
    EXPECT_EQ(platform::describe(nrx::match_usage_pairs({nrx::usage_pair(0xFF00, 0x20)})),
              "{DeviceUsagePairs = ({DeviceUsagePage = 65280; DeviceUsage = 32})}");
}

TEST_F(services, list_continues_after_an_unreadable_name) {
    add_service(host, "WQR_wqr-button", 0x40);
    host.add({.name = "other", .classes = {"KeltoNRXHIDDevice"}});
    add_service(host, "negative", -1);
    host.add({.name = "a_name_that_is_longer_than_its_column",
              .classes = {"KeltoNRXInterface"},
              .properties = {{"service_id", "text"}}});
    const std::string button = "WQR_wqr-button           0x40\n";
    const std::string rest =
        "negative                 0xffffffff\n"
        "a_name_that_is_longer_than_its_column no id\n";
    platform::return_code result = platform::no_memory;
    const auto listing = [&] { return capture([&] { result = nrx::list_services(); }); };
    EXPECT_EQ(listing().out, button + rest);
    EXPECT_EQ(result, platform::success);
    host.fail_call(2, failure::io);
    const outcome partial = listing();
    EXPECT_EQ(partial.out, rest);
    EXPECT_EQ(partial.err, library_report(file, "kr == 0 ", io_text));
    EXPECT_EQ(result, platform::simulated::io_failure);
    host.fail_call(1, failure::no_memory);
    EXPECT_EQ(listing().out, "");
    EXPECT_EQ(result, platform::no_memory);
}

TEST_F(services, property_reads_back_as_set) {
    add_service(host, "accel", 31);
    const platform::service service = service_named("accel");
    const platform::property value(platform::array{1, "two", platform::dictionary{{"k", 3}}});
    EXPECT_EQ(nrx::set_service_property(service, "ReportRates", &value), platform::success);
    EXPECT_EQ(report_of(platform::success,
                        [&] { return nrx::show_service_property(service, "ReportRates"); }),
              "(1, \"two\", {k = 3})\n");
}

TEST_F(services, missing_or_refused_property_is_reported) {
    add_service(host, "accel", 31);
    const platform::service service = service_named("accel");
    const platform::property value(1);
    const auto result = capture([&] {
        EXPECT_EQ(nrx::set_service_property(service, nullptr, &value), platform::bad_argument);
        EXPECT_EQ(nrx::set_service_property(service, "x", nullptr), platform::bad_argument);
        EXPECT_EQ(nrx::show_service_property(service, nullptr), platform::success);
        EXPECT_EQ(nrx::show_service_property(service, "x"), platform::success);
        host.fail_call(1, failure::unsupported);
        EXPECT_EQ(nrx::set_service_property(service, "x", &value), platform::unsupported);
    });
    const std::string missing =
        library_report(file, "propertyName") + library_report(file, "property");
    EXPECT_EQ(result.err, missing + missing + library_report(file, "kr == 0 ", unsupported_text));
}

}  // namespace

}  // namespace tests
