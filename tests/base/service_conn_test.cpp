#include "nrxctl/base/service_conn.h"

#include "tests/support/device_test.h"

namespace tests {

namespace {

constexpr const char* file = source_file::service_conn;

using nrx::on_failure;

class service_conn : public device_test {
protected:
    void add_app() {
        const auto app = host.add({.name = "NRXApp", .classes = {"Anything"}});
        host.add({.name = "client", .driver = std::make_shared<interface_driver>()}, app);
    }

    // Opens a connection, which must fail and hold this many handles. Returns the failure report.
    std::string fail_to_open(on_failure on_missing, std::size_t handles) {
        return capture([&] {
                   nrx::service_conn conn("NRXApp");
                   EXPECT_FALSE(conn.open(on_missing));
                   EXPECT_EQ(host.open_handles(), handles);
               })
            .err;
    }
};

TEST_F(service_conn, opens_the_first_child_and_releases_everything) {
    add_app();
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

TEST_F(service_conn, failed_step_is_reported_unless_a_missing_service_is_ignored) {
    host.add({.name = "WQR_NRXApp"});
    EXPECT_EQ(fail_to_open(on_failure::report, 0), library_report(file, "service"));
    EXPECT_EQ(fail_to_open(on_failure::ignore, 0), "");
    host.add({.name = "NRXApp"});
    EXPECT_EQ(fail_to_open(on_failure::ignore, 1), library_report(file, "child"));
    host.remove("NRXApp");
    add_app();
    host.fail_call(3, failure::no_memory);
    EXPECT_EQ(fail_to_open(on_failure::ignore, 2),
              library_report(file, "kr == 0 ", no_memory_text));
    host.fail_call(3, failure::empty_result);
    EXPECT_EQ(fail_to_open(on_failure::report, 2), library_report(file, "connect"));
}

}  // namespace

}  // namespace tests
