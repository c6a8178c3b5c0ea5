#include "keyprobe/hid_feature_reports.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "keyprobe/checks.h"
#include "nrxctl/nrxtoollib.h"
#include "platform/hid_device.h"
#include "platform/registry.h"

namespace nrx::keyprobe {

namespace {

constexpr std::int32_t vendor_page = 0xFF00;
constexpr std::int32_t button_usage = 0x20;
constexpr std::size_t largest_report = 256;

struct feature_report_row {
    std::uint8_t id;
    std::string_view banner;
};

constexpr std::array feature_reports{
    feature_report_row{0xe0, "==============hidreport get 0xe0 -u 0xFF00,0x0020==============="},
    feature_report_row{0xb4, "==============hidreport get 0xb4 -u 0xFF00,0x0020==============="},
    feature_report_row{0xe1, "==============hidreport get 0xe1 -u 0xFF00,0x0020==============="},
    feature_report_row{0xe2, "==============hidreport get 0xe2 -u 0xFF00,0x0020==============="},
    feature_report_row{0xe3, "==============hidreport get 0xe3 -u 0xFF00,0x0020==============="},
    feature_report_row{0xe4, "==============hidreport get 0xe4 -u 0xFF00,0x0020==============="},
};

platform::service find_button_device() {
    platform::dictionary matching = match_usage_pairs({usage_pair(vendor_page, button_usage)});
    matching.set(platform::provider_class_key, "IOHIDDevice");
    return platform::first_match(matching);
}

void dump_reports(const platform::hid_device& device) {
    std::array<std::uint8_t, largest_report> buffer;
    for (const feature_report_row& row : feature_reports) {
        print_line(row.banner);
        platform::byte_span report = buffer;
        const auto result = platform::feature_report(device, row.id, report);
        if (!check_success(result, "result == 0 ")) return;
        hex_dump(report);
    }
}

}  // namespace

void dump_hid_feature_reports() {
    const platform::service service = find_button_device();
    if (!check(service, "service")) return;
    const platform::hid_device device = platform::create_hid_device(service);
    if (!check(device, "device")) return;
    const auto result = platform::open(device);
    if (check_success(result, "result == 0 ")) dump_reports(device);
    platform::close(device);
}

}  // namespace nrx::keyprobe
