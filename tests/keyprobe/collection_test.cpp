// The collection on the embedded device, whole and with parts of the device missing.
#include "keyprobe/collection.h"

#include <algorithm>
#include <memory>

#include "platform/virtual/wrist_device.h"
#include "tests/golden/golden_text.h"
#include "tests/support/argument_vector.h"
#include "tests/support/device_test.h"
#include "tests/support/fault_sweep.h"

namespace tests {

namespace {

using nrx::keyprobe::collect_all;
using platform::simulated::make_wrist_device;

const std::string whole_text = golden_text("keyprobe_collectall.txt");

// Returns the whole text from the banner with one name to that with another.
std::string between_banners(const std::string& first, const std::string& next) {
    const auto line_with = [](const std::string& name) {
        return whole_text.rfind("\n==", whole_text.find(name)) + 1;
    };
    return whole_text.substr(line_with(first), line_with(next) - line_with(first));
}

const std::string stats_text = between_banners("get-stats", "arc 0xd0");
const std::string diagnostics_text = between_banners("arc 0xd0", "get-assets");
const std::string assets_text = between_banners("get-assets", "hidreport get 0xe0");
const std::string features_text =
    whole_text.substr(stats_text.size() + diagnostics_text.size() + assets_text.size());

// Returns a text up to the end of the banner with a name.
std::string through_banner(const std::string& text, const std::string& name) {
    return text.substr(0, text.find('\n', text.find(name)) + 1);
}

std::string banners(const std::string& text) {
    std::string banners;
    for (const std::string& line : split(text, '\n'))
        if (line.starts_with("==")) banners += line + "\n";
    return banners;
}

std::string front_end_failure(std::string_view condition, std::string_view code = "") {
    return failure_line("keyprobe", condition, source_file::collection, code);
}

const std::string service_missing =
    library_report(source_file::channel, "service") + front_end_failure("kr == 0 ", not_found_text);
const std::string report_unsupported =
    library_report(source_file::command_channel, "kr == 0 ", unsupported_text) +
    front_end_failure("kr == 0 ", unsupported_text);

}  // namespace

class collection : public ::testing::Test {
public:
    collection() { device->record_calls(); }
    ~collection() override { EXPECT_EQ(device->open_handles(), 0U); }
    collection(const collection&) = delete;
    collection& operator=(const collection&) = delete;

protected:
    static void expect_collected(const std::string& out, const std::string& err) {
        const auto result = capture(collect_all);
        EXPECT_EQ(result.out, out);
        EXPECT_EQ(result.err, err);
    }
    static void expect_features(const std::string& out, const std::string& err) {
        expect_collected(stats_text + diagnostics_text + assets_text + out, err);
    }
    [[nodiscard]] interface_driver& driver(std::string_view name) const {
        return dynamic_cast<interface_driver&>(*device->find(name)->driver);
    }

    std::unique_ptr<machine> device = make_wrist_device();
    interface_driver& button = driver("WQR_wqr-button");
    platform::simulated::virtual_hid_device& hid = *device->find("wqr-button-hid")->hid;

private:
    platform::simulated::installed_machine installed_{*device};
};

TEST_F(collection, continues_after_a_step_without_its_report_or_service) {
    button.drop_report(0xd7);
    button.drop_report(0xd8);
    expect_collected(diagnostics_text + features_text, report_unsupported + report_unsupported);
    device->remove("arc");
    expect_collected(through_banner(diagnostics_text, "arc 0xd0") + features_text,
                     report_unsupported + service_missing + report_unsupported);
}

TEST_F(collection, stops_diagnostic_reports_at_the_first_failure) {
    const std::string diagnostics = through_banner(diagnostics_text, "wqr-button 0xd0");
    button.drop_report(0xd0);
    expect_collected(stats_text + diagnostics + assets_text + features_text, report_unsupported);
    // The service can also go away between two steps, and its HID device with it.
    const std::size_t calls_of_first_step = 3;
    device->before_call(calls_of_first_step + 1, [&] { device->remove("WQR_wqr-button"); });
    expect_collected(stats_text + diagnostics,
                     service_missing + service_missing + front_end_failure("service"));
}

TEST_F(collection, prints_only_the_banner_of_an_empty_report) {
    for (const std::uint32_t id : {0xd0U, 0xd1U, 0xd7U, 0xd8U})
        button.set_report(id, {});
    for (const char* name : {"arc", "btmspk"})
        driver(name).set_report(0xd0, {});
    for (const std::uint8_t id : byte_list{0xe0, 0xb4, 0xe1, 0xe2, 0xe3, 0xe4})
        hid.set_feature_report(id, {});
    expect_collected(banners(whole_text), "");
}

TEST_F(collection, refuses_a_report_larger_than_its_buffer) {
    const auto resize = [&](std::size_t extra) {
        button.set_report(0xd7, byte_list(2000 + extra));
        driver("arc").set_report(0xd0, byte_list(4096 + extra, 'x'));
        button.set_report(0xd8, byte_list(4096 + extra));
        hid.set_feature_report(0xe4, byte_list(256 + extra, 'y'));
    };
    resize(1);
    const auto refused = capture(collect_all);
    EXPECT_EQ(refused.out, through_banner(diagnostics_text, "arc 0xd0") +
                               through_banner(features_text, "hidreport get 0xe4"));
    resize(0);
    const auto full = capture(collect_all);
    EXPECT_EQ(full.err, "");
    EXPECT_EQ(banners(full.out), banners(whole_text));
}

TEST_F(collection, needs_a_hid_device_with_that_class_and_usage) {
    device->remove("wqr-button-hid");
    const auto add = [&](const char* hid_class, int page, int usage) {
        const platform::dictionary pair{{"DeviceUsagePage", page}, {"DeviceUsage", usage}};
        device->add({.name = "other",
                     .classes = {hid_class},
                     .properties = {{"DeviceUsagePairs", platform::array{pair}}},
                     .hid = std::make_shared<platform::simulated::virtual_hid_device>()});
    };
    add("IOHIDDevice", 0xFF00, 0x21);
    add("IOHIDDevice", 0xFF01, 0x20);
    add("KeltoNRXHIDDevice", 0xFF00, 0x20);
    expect_features("", front_end_failure("service"));
}

TEST_F(collection, stops_feature_reports_at_the_first_failure) {
    hid.drop_feature_report(0xb4);
    expect_features(through_banner(features_text, "hidreport get 0xb4"),
                    front_end_failure("result == 0 ", unsupported_text));
    constexpr std::size_t calls_of_last_step = 5;  // match, create, open, two reports, close
    const std::size_t create_call = device->calls_made() - calls_of_last_step + 1;
    device->fail_call(create_call, failure::empty_result);
    expect_features("", front_end_failure("device"));
    device->fail_call(create_call + 1, failure::io);
    expect_features("", front_end_failure("result == 0 ", io_text));
    const auto closes =
        std::count_if(device->log().begin(), device->log().end(),
                      [](const std::string& call) { return call.starts_with("close hid device"); });
    EXPECT_EQ(closes, 2);
}

// A failure reaches a check of the front end, unless it is that of a close. Missing bytes in a
// reply are not a failure: every banner is printed then.
bool is_acceptable(const fault& fault) {
    const bool is_close = fault.name.starts_with("close ");
    const bool by_front_end = fault.result.err.find("failed: keyprobe: ") != std::string::npos;
    return is_close || by_front_end ||
           (is_reported(fault) && banners(fault.result.out) == banners(whole_text));
}

// The last step prints a banner, or its own failure is the last one.
bool tries_last_step(const fault& fault) {
    const std::string& err = fault.result.err;
    const std::string last_report = err.substr(err.rfind("Assertion") + 1);
    return fault.result.out.find("hidreport get 0xe0") != std::string::npos ||
           last_report.find(": keyprobe: Check failed: kr") == std::string::npos;
}

TEST(collection_fault_sweep, reports_every_failure_and_tries_the_last_step) {
    sweep_faults(make_wrist_device, collect_all,
                 [](const fault& fault) { return is_acceptable(fault) && tries_last_step(fault); });
}

}  // namespace tests
