#include "nrxctl/base/service_conn.h"

#include "tests/support/device_test.h"

namespace {

using tests::capture;
using tests::failure;
using tests::failure_line;

constexpr const char* source = "nrxctl/base/service_conn.cpp";

class service_conn : public tests::device_test {
protected:
    void put_app() {
        const auto app = host.add({.name = "NRXApp", .classes = {"Anything"}});
        host.add({.name = "client", .unit = std::make_shared<tests::interface_driver>()}, app);
    }
};

TEST_F(service_conn, opens_the_first_child_of_a_service_of_any_class_and_gives_all_back) {
    put_app();
    {
        nrx::service_conn conn("NRXApp");
        EXPECT_FALSE(conn.connection());
        EXPECT_TRUE(conn.open(false));
        EXPECT_TRUE(conn.connection());
        EXPECT_EQ(host.open_handles(), 3U);
    }
    EXPECT_EQ(host.log(),
              (std::vector<std::string>{"first match {IONameMatch = \"NRXApp\"}",
                                        "first child of NRXApp", "open client type 0",
                                        "close client", "release client", "release NRXApp"}));
}

TEST_F(service_conn, does_not_try_the_prefix) {
    host.add({.name = "WQR_NRXApp"});
    const auto result = capture([] { EXPECT_FALSE(nrx::service_conn("NRXApp").open(false)); });
    EXPECT_EQ(result.err, failure_line("nrxtoollib", "service", source));
}

TEST_F(service_conn, is_quiet_only_about_a_missing_service) {
    EXPECT_EQ(capture([] { EXPECT_FALSE(nrx::service_conn("NRXApp").open(true)); }).err, "");
    host.add({.name = "NRXApp"});
    const auto result = capture([] { EXPECT_FALSE(nrx::service_conn("NRXApp").open(true)); });
    EXPECT_EQ(result.err, failure_line("nrxtoollib", "child", source));
}

TEST_F(service_conn, reports_a_failed_open_and_keeps_what_it_found_until_the_end) {
    put_app();
    host.fail_call(3, failure::no_memory);
    const auto result = capture([&] {
        nrx::service_conn conn("NRXApp");
        EXPECT_FALSE(conn.open(false));
        EXPECT_EQ(host.open_handles(), 2U);
    });
    EXPECT_EQ(result.err,
              failure_line("nrxtoollib", "kr == 0 ", source, "out of memory (0xe00002bd)"));
    host.fail_call(3, failure::nothing);
    const auto unconnected =
        capture([&] { EXPECT_FALSE(nrx::service_conn("NRXApp").open(false)); });
    EXPECT_EQ(unconnected.err, failure_line("nrxtoollib", "connect", source));
}

}  // namespace
