#include "nrxctl/base/service_list.h"

#include "tests/support/device_test.h"

namespace tests {

using service_list = device_test;

TEST_F(service_list, shows_names_and_ids_of_the_interface_services_in_order) {
    put_service(host, "WQR_wqr-button", 0x40);
    host.add({.name = "stranger", .classes = {"KeltoNRXHIDDevice"}});
    put_service(host, "negative", -1);
    host.add({.name = "a_name_that_is_longer_than_its_column",
              .classes = {"KeltoNRXInterface"},
              .properties = {{"service_id", "text"}}});
    platform::return_code result = platform::no_memory;
    EXPECT_EQ(capture([&] { result = nrx::list_services(); }).out,
              "WQR_wqr-button           0x40\n"
              "negative                 0xffffffff\n"
              "a_name_that_is_longer_than_its_column no id\n");
    EXPECT_EQ(result, platform::success);
}

TEST_F(service_list, goes_on_after_a_name_that_cannot_be_read_and_fails) {
    put_service(host, "one", 1);
    put_service(host, "two", 2);
    host.fail_call(2, failure::io);
    platform::return_code result = platform::success;
    const outcome written = capture([&] { result = nrx::list_services(); });
    EXPECT_EQ(written.out, "two                      0x2\n");
    EXPECT_EQ(written.err,
              failure_line("nrxtoollib", "kr == 0 ", "nrxctl/base/service_list.cpp", io_text));
    EXPECT_EQ(result, platform::simulated::io_failure);
    host.fail_call(1, failure::no_memory);
    EXPECT_EQ(capture([&] { result = nrx::list_services(); }).out, "");
    EXPECT_EQ(result, platform::no_memory);
}

}  // namespace tests
