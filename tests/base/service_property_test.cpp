#include "nrxctl/base/service_property.h"

#include "tests/support/device_test.h"

namespace tests {

namespace {

constexpr const char* file = "base/service_property.cpp";

class service_property : public device_test {
protected:
    interface_driver& accel = put_service(host, "accel", 31);
    platform::service service = service_named("accel");
};

TEST_F(service_property, reads_back_what_was_set) {
    const platform::property value(platform::array{1, "two", platform::dictionary{{"k", 3}}});
    EXPECT_EQ(nrx::set_service_property(service, "ReportRates", &value), platform::success);
    EXPECT_EQ(reported(platform::success,
                       [&] { return nrx::show_service_property(service, "ReportRates"); }),
              "(1, \"two\", {k = 3})\n");
}

TEST_F(service_property, reports_what_is_missing_or_refused) {
    const platform::property value(1);
    const auto result = capture([&] {
        EXPECT_EQ(nrx::set_service_property(service, nullptr, &value), platform::bad_argument);
        EXPECT_EQ(nrx::set_service_property(service, "x", nullptr), platform::bad_argument);
        EXPECT_EQ(nrx::show_service_property(service, nullptr), platform::success);
        EXPECT_EQ(nrx::show_service_property(service, "x"), platform::success);
        host.fail_call(1, failure::unsupported);
        EXPECT_EQ(nrx::set_service_property(service, "x", &value), platform::unsupported);
    });
    const std::string missing = failed(file, "propertyName") + failed(file, "property");
    EXPECT_EQ(result.err, missing + missing + failed(file, "kr == 0 ", unsupported_text));
}

}  // namespace

}  // namespace tests
