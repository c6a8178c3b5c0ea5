#include "keyprobe/collection.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/nrxtoollib.h"
#include "platform/hid_device.h"
#include "platform/registry.h"

namespace nrx::keyprobe {

namespace {

// The front end's own checks: like those of the library, under its own label.
constexpr const char* front_end_label = "keyprobe";

template <class Handle>
bool check(const Handle& handle, const char* text,
           source_location location = source_location::current()) {
    return check_as(front_end_label, static_cast<bool>(handle), text, platform::success, location);
}

bool check_success(platform::return_code code, const char* text,
                   source_location location = source_location::current()) {
    return check_as(front_end_label, code == platform::success, text, code, location);
}

constexpr std::string_view button_service = "wqr-button";
constexpr report_id button_stats_report = 0xd7;
constexpr report_id haptic_assets_report = 0xd8;

void dump_button_stats() {
    std::array<std::uint8_t, 2000> buffer;
    platform::byte_span report = buffer;
    const auto kr = get_report(button_service, button_stats_report, report);
    if (!check_success(kr, condition::kr_is_zero)) return;
    print_line("==========keyprobe get-stats==============");
    print_button_stats(button_service, button_stats_report, report);
}

struct diagnostic_report {
    std::string_view banner;
    std::string_view service_name;
    report_id id;
};

constexpr std::array diagnostic_reports{
    diagnostic_report{"==========keyprobe arc 0xd0==============", "arc", 0xd0},
    diagnostic_report{"==========keyprobe btmspk 0xd0==============", "btmspk", 0xd0},
    diagnostic_report{"==========keyprobe wqr-button 0xd0==============", button_service, 0xd0},
    diagnostic_report{"==========keyprobe wqr-button 0xd1==============", button_service, 0xd1},
};

// The banner of a report is printed before the report is read. The first failure ends the step.
void dump_diagnostic_reports() {
    std::array<std::uint8_t, 4096> buffer;
    for (const diagnostic_report& row : diagnostic_reports) {
        print_line(row.banner);
        platform::byte_span report = buffer;
        const auto kr = get_report(row.service_name, row.id, report);
        if (!check_success(kr, condition::kr_is_zero)) return;
        print_report(row.service_name, row.id, report);
    }
}

void dump_haptic_assets() {
    std::array<std::uint8_t, 4096> buffer;
    platform::byte_span report = buffer;
    const auto kr = get_report(button_service, haptic_assets_report, report);
    if (!check_success(kr, condition::kr_is_zero)) return;
    print_line("==========keyprobe wqr-button get-assets==============");
    print_haptic_assets(button_service, haptic_assets_report, report);
}

constexpr std::int32_t vendor_page = 0xFF00;
constexpr std::int32_t button_usage = 0x20;
constexpr std::size_t max_feature_report_size = 256;

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

void dump_feature_reports(const platform::hid_device& device) {
    std::array<std::uint8_t, max_feature_report_size> buffer;
    for (const feature_report_row& row : feature_reports) {
        print_line(row.banner);
        platform::byte_span report = buffer;
        const auto result = platform::read_feature_report(device, row.id, report);
        if (!check_success(result, condition::result_is_zero)) return;
        hex_dump(report);
    }
}

void dump_hid_feature_reports() {
    const platform::service service = find_button_device();
    if (!check(service, condition::service)) return;
    const platform::hid_device device = platform::create_hid_device(service);
    if (!check(device, "device")) return;
    const auto result = platform::open(device);
    if (check_success(result, condition::result_is_zero)) dump_feature_reports(device);
    // A close that fails changes nothing any more and is not reported.
    platform::close(device);
}

}  // namespace

void collect_all() {
    dump_button_stats();
    dump_diagnostic_reports();
    dump_haptic_assets();
    dump_hid_feature_reports();
}

}  // namespace nrx::keyprobe
