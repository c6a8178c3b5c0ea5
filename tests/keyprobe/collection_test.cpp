#include "keyprobe/collection.h"

#include "keyprobe/hid_feature_reports.h"
#include "tests/keyprobe/button_host.h"

namespace {

using tests::byte_list;
using tests::capture;
using tests::failure;
using tests::failure_line;

const std::string short_stats =
    failure_line("nrxtoollib", "length >= 282", "nrxctl/printers/button_stats.cpp");

// The two reports of a read that found no service.
const std::string service_missing =
    failure_line("nrxtoollib", "service", "nrxctl/base/channel.cpp") +
    failure_line("keyprobe", "kr == 0 ", "keyprobe/collection.cpp",
                 "service not found (0xe00002f0)");

// The two reports of a read that the service refused.
const std::string report_unsupported =
    failure_line("nrxtoollib", "kr == 0 ", "nrxctl/base/command_channel.cpp",
                 "unsupported request (0xe00002c7)") +
    failure_line("keyprobe", "kr == 0 ", "keyprobe/collection.cpp",
                 "unsupported request (0xe00002c7)");

class collection : public tests::device_test {
protected:
    tests::button_host services = tests::put_button_services(host);
};

TEST_F(collection, prints_every_step_in_order) {
    const auto result = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(result.out, tests::stats_text() + tests::diagnostics_text() + tests::assets_text() +
                              tests::features_text());
    EXPECT_EQ(result.err, short_stats);
}

TEST_F(collection, offers_every_read_its_full_capacity) {
    capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(logged("call"),
              (std::vector<std::string>{
                  "call WQR_wqr-button 2 scalars [0xd7] in [] results 0 room 2000",
                  "call arc 2 scalars [0xd0] in [] results 0 room 4096",
                  "call btmspk 2 scalars [0xd0] in [] results 0 room 4096",
                  "call WQR_wqr-button 2 scalars [0xd0] in [] results 0 room 4096",
                  "call WQR_wqr-button 2 scalars [0xd1] in [] results 0 room 4096",
                  "call WQR_wqr-button 2 scalars [0xd8] in [] results 0 room 4096"}));
    std::vector<std::string> expected;
    for (const int id : {0xe0, 0xb4, 0xe1, 0xe2, 0xe3, 0xe4}) {
        expected.push_back("feature report of button-hid " + std::to_string(id) + " room 256");
    }
    EXPECT_EQ(logged("feature"), expected);
}

TEST_F(collection, goes_on_after_a_step_without_its_report) {
    services.button->drop_report(0xd7);
    services.button->drop_report(0xd8);
    const auto result = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(result.out, tests::diagnostics_text() + tests::features_text());
    EXPECT_EQ(result.err, report_unsupported + report_unsupported);
}

TEST_F(collection, missing_service_ends_only_its_step) {
    host.remove("arc");
    const auto result = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(result.out, tests::stats_text() + "==========keyprobe arc 0xd0==============\n" +
                              tests::assets_text() + tests::features_text());
    EXPECT_EQ(result.err, short_stats + service_missing);
}

TEST_F(collection, stops_the_diagnostic_reports_at_the_first_that_fails) {
    services.button->drop_report(0xd0);
    const auto result = capture(nrx::keyprobe::collect_all);
    const auto diagnostics = tests::diagnostics_text();
    const std::string last_banner = "==========keyprobe wqr-button 0xd0==============\n";
    EXPECT_EQ(result.out,
              tests::stats_text() +
                  diagnostics.substr(0, diagnostics.find(last_banner) + last_banner.size()) +
                  tests::assets_text() + tests::features_text());
    EXPECT_EQ(result.err, short_stats + report_unsupported);
}

TEST_F(collection, a_service_may_go_away_between_two_steps) {
    const std::size_t calls_of_the_first_step = 3;
    host.before_call(calls_of_the_first_step + 1, [&] { host.remove("WQR_wqr-button"); });
    const auto result = capture(nrx::keyprobe::collect_all);
    const auto diagnostics = tests::diagnostics_text();
    const std::string last_banner = "==========keyprobe wqr-button 0xd0==============\n";
    EXPECT_EQ(result.out,
              tests::stats_text() +
                  diagnostics.substr(0, diagnostics.find(last_banner) + last_banner.size()) +
                  tests::features_text());
    EXPECT_EQ(result.err, short_stats + service_missing + service_missing);
}

TEST_F(collection, a_report_without_bytes_leaves_its_banner_alone) {
    for (const std::uint32_t id : {0xd0U, 0xd1U, 0xd7U, 0xd8U})
        services.button->set_report(id, {});
    const auto result = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(result.err, "");
    EXPECT_NE(result.out.find("==========keyprobe get-stats==============\n"
                              "==========keyprobe arc 0xd0==============\n"),
              std::string::npos);
    EXPECT_NE(result.out.find("==========keyprobe wqr-button 0xd0==============\n"
                              "==========keyprobe wqr-button 0xd1==============\n"
                              "==========keyprobe wqr-button get-assets==============\n"
                              "==============hidreport get 0xe0"),
              std::string::npos);
}

TEST_F(collection, a_report_that_does_not_fit_is_refused_not_cut) {
    services.arc->set_report(0xd0, byte_list(4097));
    services.button->set_report(0xd7, byte_list(2001));
    const auto result = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(result.out, "==========keyprobe arc 0xd0==============\n" + tests::assets_text() +
                              tests::features_text());
    services.arc->set_report(0xd0, byte_list(4096, 'x'));
    services.button->set_report(0xd7, byte_list(2000));
    const auto full = capture(nrx::keyprobe::collect_all);
    EXPECT_EQ(full.err, "");
    EXPECT_NE(full.out.find("00000ff0: 78 78"), std::string::npos);
}

class hid_feature_reports : public tests::device_test {
protected:
    std::string failed(std::string_view condition, std::string_view code = "") {
        return failure_line("keyprobe", condition, "keyprobe/hid_feature_reports.cpp", code);
    }

    tests::button_host services = tests::put_button_services(host);
};

TEST_F(hid_feature_reports, need_the_device_with_that_usage) {
    host.remove("button-hid");
    const platform::dictionary usage{{"DeviceUsagePage", 0xFF00}, {"DeviceUsage", 0x21}};
    host.add({.name = "other",
              .classes = {"IOHIDDevice"},
              .properties = {{"DeviceUsagePairs", platform::array{usage}}}});
    const auto result = capture(nrx::keyprobe::dump_hid_feature_reports);
    EXPECT_EQ(result.out, "");
    EXPECT_EQ(result.err, failed("service"));
    EXPECT_EQ(host.log().back(),
              "first match {DeviceUsagePairs = ({DeviceUsagePage = 65280; DeviceUsage = 32}); "
              "IOProviderClass = \"IOHIDDevice\"}");
}

TEST_F(hid_feature_reports, report_a_device_that_cannot_be_made_or_opened) {
    host.fail_call(2, failure::nothing);
    const auto no_device = capture(nrx::keyprobe::dump_hid_feature_reports);
    EXPECT_EQ(no_device.out, "");
    EXPECT_EQ(no_device.err, failed("device"));
    host.fail_call(3, failure::io);
    const auto closed = capture(nrx::keyprobe::dump_hid_feature_reports);
    EXPECT_EQ(closed.out, "");
    EXPECT_EQ(closed.err, failed("result == 0 ", "device i/o failure (0xe0000401)"));
    EXPECT_EQ(logged("close").size(), 1U);
}

TEST_F(hid_feature_reports, stop_at_the_first_that_fails_and_close_the_device) {
    services.hid->drop_feature_report(0xb4);
    const auto result = capture(nrx::keyprobe::dump_hid_feature_reports);
    EXPECT_EQ(result.out,
              "==============hidreport get 0xe0 -u 0xFF00,0x0020===============\n"
              "00000000: e0                                                | .\n"
              "==============hidreport get 0xb4 -u 0xFF00,0x0020===============\n");
    EXPECT_EQ(result.err, failed("result == 0 ", "unsupported request (0xe00002c7)"));
    const std::vector<std::string> last(host.log().end() - 3, host.log().end());
    EXPECT_EQ(last,
              (std::vector<std::string>{"close hid device button-hid",
                                        "release hid device button-hid", "release button-hid"}));
}

TEST_F(hid_feature_reports, are_dumped_as_long_as_they_came) {
    services.hid->set_feature_report(0xe0, byte_list(20, 'q'));
    const auto result = capture(nrx::keyprobe::dump_hid_feature_reports);
    EXPECT_NE(result.out.find("00000010: 71 71 71 71                                       | qqqq\n"
                              "==============hidreport get 0xb4"),
              std::string::npos);
}

}  // namespace
