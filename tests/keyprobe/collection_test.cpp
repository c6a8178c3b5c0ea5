#include "keyprobe/collection.h"

#include "keyprobe/hid_feature_reports.h"
#include "tests/keyprobe/button_host.h"

namespace tests {

namespace {

const std::string short_stats =
    failure_line("nrxtoollib", "length >= 282", "nrxctl/printers/button_stats.cpp");

// The two reports of a read that found no service, and of one that the service refused.
const std::string service_missing =
    failure_line("nrxtoollib", "service", "nrxctl/base/channel.cpp") +
    failure_line("keyprobe", "kr == 0 ", "keyprobe/collection.cpp", not_found_text);
const std::string report_unsupported =
    failure_line("nrxtoollib", "kr == 0 ", "nrxctl/base/command_channel.cpp", unsupported_text) +
    failure_line("keyprobe", "kr == 0 ", "keyprobe/collection.cpp", unsupported_text);

// The diagnostic reports up to the banner of one.
std::string diagnostics_until(const std::string& report) {
    const std::string banner = "==========keyprobe " + report + "==============\n";
    const std::string all = diagnostics_text();
    return all.substr(0, all.find(banner) + banner.size());
}

std::string dump_failed(std::string_view condition, std::string_view code = "") {
    return failure_line("keyprobe", condition, "keyprobe/hid_feature_reports.cpp", code);
}

}  // namespace

class collection : public device_test {
protected:
    static void expect_collected(const std::string& out, const std::string& err) {
        const auto result = capture(nrx::keyprobe::collect_all);
        EXPECT_EQ(result.out, out);
        EXPECT_EQ(result.err, err);
    }
    static void expect_feature_reports(const std::string& out, const std::string& err) {
        const auto result = capture(nrx::keyprobe::dump_hid_feature_reports);
        EXPECT_EQ(result.out, out);
        EXPECT_EQ(result.err, err);
    }

    button_host services = put_button_services(host);
};

TEST_F(collection, prints_every_step_in_order_and_offers_every_read_its_full_capacity) {
    expect_collected(whole_text(), short_stats);
    EXPECT_EQ(logged("call"),
              (std::vector<std::string>{
                  "call WQR_wqr-button 2 scalars [0xd7] in [] results 0 room 2000",
                  "call arc 2 scalars [0xd0] in [] results 0 room 4096",
                  "call btmspk 2 scalars [0xd0] in [] results 0 room 4096",
                  "call WQR_wqr-button 2 scalars [0xd0] in [] results 0 room 4096",
                  "call WQR_wqr-button 2 scalars [0xd1] in [] results 0 room 4096",
                  "call WQR_wqr-button 2 scalars [0xd8] in [] results 0 room 4096"}));
    std::vector<std::string> expected;
    for (const int id : {0xe0, 0xb4, 0xe1, 0xe2, 0xe3, 0xe4})
        expected.push_back("feature report of button-hid " + std::to_string(id) + " room 256");
    EXPECT_EQ(logged("feature"), expected);
}

TEST_F(collection, goes_on_after_a_step_without_its_report_or_service) {
    services.button->drop_report(0xd7);
    services.button->drop_report(0xd8);
    expect_collected(diagnostics_text() + features_text(), report_unsupported + report_unsupported);
    host.remove("arc");
    expect_collected(diagnostics_until("arc 0xd0") + features_text(),
                     report_unsupported + service_missing + report_unsupported);
}

TEST_F(collection, stops_the_diagnostic_reports_at_the_first_that_fails) {
    services.button->drop_report(0xd0);
    expect_collected(
        stats_text() + diagnostics_until("wqr-button 0xd0") + assets_text() + features_text(),
        short_stats + report_unsupported);
    // The service may also go away between two steps.
    const std::size_t calls_of_the_first_step = 3;
    host.before_call(calls_of_the_first_step + 1, [&] { host.remove("WQR_wqr-button"); });
    expect_collected(stats_text() + diagnostics_until("wqr-button 0xd0") + features_text(),
                     short_stats + service_missing + service_missing);
}

TEST_F(collection, a_report_without_bytes_leaves_its_banner_alone) {
    for (const std::uint32_t id : {0xd0U, 0xd1U, 0xd7U, 0xd8U})
        services.button->set_report(id, {});
    expect_collected("==========keyprobe get-stats==============\n" +
                         diagnostics_until("wqr-button 0xd0") +
                         "==========keyprobe wqr-button 0xd1==============\n"
                         "==========keyprobe wqr-button get-assets==============\n" +
                         features_text(),
                     "");
}

TEST_F(collection, a_report_that_does_not_fit_is_refused_not_cut) {
    services.arc->set_report(0xd0, byte_list(4097));
    services.button->set_report(0xd7, byte_list(2001));
    const auto result = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(result.out, diagnostics_until("arc 0xd0") + assets_text() + features_text());
    services.arc->set_report(0xd0, byte_list(4096, 'x'));
    services.button->set_report(0xd7, byte_list(2000));
    const auto full = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(full.err, "");
    EXPECT_NE(full.out.find("00000ff0: 78 78"), std::string::npos);
}

TEST_F(collection, of_feature_reports_needs_a_device_with_that_usage_that_can_be_opened) {
    host.fail_call(2, failure::nothing);
    expect_feature_reports("", dump_failed("device"));
    host.fail_call(3, failure::io);
    expect_feature_reports("", dump_failed("result == 0 ", io_text));
    EXPECT_EQ(logged("close").size(), 1U);
    host.remove("button-hid");
    const platform::dictionary usage{{"DeviceUsagePage", 0xFF00}, {"DeviceUsage", 0x21}};
    host.add({.name = "other",
              .classes = {"IOHIDDevice"},
              .properties = {{"DeviceUsagePairs", platform::array{usage}}}});
    expect_feature_reports("", dump_failed("service"));
    EXPECT_EQ(host.log().back(),
              "first match {DeviceUsagePairs = ({DeviceUsagePage = 65280; DeviceUsage = 32}); "
              "IOProviderClass = \"IOHIDDevice\"}");
}

TEST_F(collection, of_feature_reports_stops_at_the_first_that_fails_and_closes_the_device) {
    services.hid->drop_feature_report(0xb4);
    services.hid->set_feature_report(0xe0, byte_list(20, 'q'));
    expect_feature_reports(
        "==============hidreport get 0xe0 -u 0xFF00,0x0020===============\n"
        "00000000: 71 71 71 71 71 71 71 71  71 71 71 71 71 71 71 71  | qqqqqqqq qqqqqqqq\n"
        "00000010: 71 71 71 71                                       | qqqq\n"
        "==============hidreport get 0xb4 -u 0xFF00,0x0020===============\n",
        dump_failed("result == 0 ", unsupported_text));
    EXPECT_EQ(std::vector<std::string>(host.log().end() - 3, host.log().end()),
              (std::vector<std::string>{"close hid device button-hid",
                                        "release hid device button-hid", "release button-hid"}));
}

}  // namespace tests
