#include "nrxctl/base/service_conn.h"

#include "tests/support/device_test.h"

namespace tests {

namespace {

constexpr const char* file = "base/service_conn.cpp";

using nrx::expected_failure;

class service_conn : public device_test {
protected:
    void put_app() {
        const auto app = host.add({.name = "NRXApp", .classes = {"Anything"}});
        host.add({.name = "client", .unit = std::make_shared<interface_driver>()}, app);
    }

    // What is reported when a connection cannot be opened, and how much it still holds then.
    std::string failing(expected_failure missing, std::size_t held) {
        return capture([&] {
                   nrx::service_conn conn("NRXApp");
                   EXPECT_FALSE(conn.open(missing));
                   EXPECT_EQ(host.open_handles(), held);
               })
            .err;
    }
};

TEST_F(service_conn, opens_the_first_child_of_a_service_of_any_class_and_gives_all_back) {
    put_app();
    {
        nrx::service_conn conn("NRXApp");
        EXPECT_FALSE(conn.connection());
        EXPECT_TRUE(conn.open());
        EXPECT_TRUE(conn.connection());
        EXPECT_EQ(host.open_handles(), 3U);
    }
    EXPECT_EQ(host.log(),
              (std::vector<std::string>{"first match {IONameMatch = \"NRXApp\"}",
                                        "first child of NRXApp", "open client type 0",
                                        "close client", "release client", "release NRXApp"}));
}

TEST_F(service_conn, reports_what_fails_and_is_quiet_only_about_a_missing_service) {
    host.add({.name = "WQR_NRXApp"});
    EXPECT_EQ(failing(expected_failure::is_reported, 0), failed(file, "service"));
    EXPECT_EQ(failing(expected_failure::is_silent, 0), "");
    host.add({.name = "NRXApp"});
    EXPECT_EQ(failing(expected_failure::is_silent, 1), failed(file, "child"));
    host.remove("NRXApp");
    put_app();
    host.fail_call(3, failure::no_memory);
    EXPECT_EQ(failing(expected_failure::is_silent, 2), failed(file, "kr == 0 ", no_memory_text));
    host.fail_call(3, failure::nothing);
    EXPECT_EQ(failing(expected_failure::is_reported, 2), failed(file, "connect"));
}

}  // namespace

}  // namespace tests
