#include "nrxctl/base/service_property.h"

#include "nrxctl/base/service_discovery.h"
#include "tests/support/device_test.h"

namespace {

using namespace tests;

class service_property : public device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        put_service(host, "accel", 31);
        service = nrx::find_service("accel");
    }
    void TearDown() override {
        service.reset();
        device_test::TearDown();
    }

    static std::string failed(std::string_view condition, std::string_view code = "") {
        return failure_line("nrxtoollib", condition, "nrxctl/base/service_property.cpp", code);
    }

    platform::service service;
};

TEST_F(service_property, reads_back_what_was_set) {
    const platform::property value(platform::array{1, "two", platform::dictionary{{"k", 3}}});
    EXPECT_EQ(nrx::set_service_property(service, "ReportRates", &value), platform::success);
    const auto result = capture(
        [&] { EXPECT_EQ(nrx::show_service_property(service, "ReportRates"), platform::success); });
    EXPECT_EQ(result.out, "");
    EXPECT_EQ(result.err, "(1, \"two\", {k = 3})\n");
}

TEST_F(service_property, reports_what_is_missing_or_refused) {
    const platform::property value(1);
    const auto result = capture([&] {
        EXPECT_EQ(nrx::set_service_property(service, nullptr, &value), platform::bad_argument);
        EXPECT_EQ(nrx::set_service_property(service, "x", nullptr), platform::bad_argument);
        EXPECT_EQ(nrx::show_service_property(service, nullptr), platform::success);
        EXPECT_EQ(nrx::show_service_property(service, "x"), platform::success);
        host.fail_call(1, tests::failure::unsupported);
        EXPECT_EQ(nrx::set_service_property(service, "x", &value), platform::unsupported);
    });
    EXPECT_EQ(result.err, failed("propertyName") + failed("property") + failed("propertyName") +
                              failed("property") + failed("kr == 0 ", unsupported_text));
}

}  // namespace
