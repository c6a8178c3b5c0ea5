#include "nrxctl/base/service_list.h"

#include "tests/support/device_test.h"

namespace tests {

using service_list = device_test;

TEST_F(service_list, shows_names_and_ids_and_goes_on_after_a_name_that_cannot_be_read) {
    put_service(host, "WQR_wqr-button", 0x40);
    host.add({.name = "stranger", .classes = {"KeltoNRXHIDDevice"}});
    put_service(host, "negative", -1);
    host.add({.name = "a_name_that_is_longer_than_its_column",
              .classes = {"KeltoNRXInterface"},
              .properties = {{"service_id", "text"}}});
    const std::string button = "WQR_wqr-button           0x40\n";
    const std::string others =
        "negative                 0xffffffff\n"
        "a_name_that_is_longer_than_its_column no id\n";
    platform::return_code result = platform::no_memory;
    const auto listing = [&] { return capture([&] { result = nrx::list_services(); }); };
    EXPECT_EQ(listing().out, button + others);
    EXPECT_EQ(result, platform::success);
    host.fail_call(2, failure::io);
    const outcome written = listing();
    EXPECT_EQ(written.out, others);
    EXPECT_EQ(written.err, failed("base/service_list.cpp", "kr == 0 ", io_text));
    EXPECT_EQ(result, platform::simulated::io_failure);
    host.fail_call(1, failure::no_memory);
    EXPECT_EQ(listing().out, "");
    EXPECT_EQ(result, platform::no_memory);
}

}  // namespace tests
