#include "keyprobe/collection.h"

#include <array>
#include <cstdint>
#include <string_view>

#include "keyprobe/checks.h"
#include "keyprobe/hid_feature_reports.h"
#include "nrxctl/nrxtoollib.h"

namespace nrx::keyprobe {

namespace {

constexpr std::string_view button_service = "wqr-button";
constexpr std::int32_t button_stats_report = 0xd7;
constexpr std::int32_t haptic_assets_report = 0xd8;

// Reads a report into the room given, which is cut to what came back.
platform::return_code read_report(std::string_view service_name, std::int32_t report_id,
                                  platform::byte_span& report) {
    return get_report(service_name, static_cast<std::uint32_t>(report_id), report);
}

void dump_button_stats() {
    std::array<std::uint8_t, 2000> buffer;
    platform::byte_span report = buffer;
    const auto kr = read_report(button_service, button_stats_report, report);
    if (!check_success(kr, "kr == 0 ")) return;
    print_line("==========keyprobe get-stats==============");
    print_button_stats(button_service, button_stats_report, report);
}

struct diagnostic_report {
    std::string_view banner;
    std::string_view service_name;
    std::int32_t report_id;
};

constexpr std::array diagnostic_reports{
    diagnostic_report{"==========keyprobe arc 0xd0==============", "arc", 0xd0},
    diagnostic_report{"==========keyprobe btmspk 0xd0==============", "btmspk", 0xd0},
    diagnostic_report{"==========keyprobe wqr-button 0xd0==============", button_service, 0xd0},
    diagnostic_report{"==========keyprobe wqr-button 0xd1==============", button_service, 0xd1},
};

// Unlike in the other steps the banner comes before the read, and the first failure ends the step.
void dump_diagnostic_reports() {
    std::array<std::uint8_t, 4096> buffer;
    for (const diagnostic_report& row : diagnostic_reports) {
        print_line(row.banner);
        platform::byte_span report = buffer;
        const auto kr = read_report(row.service_name, row.report_id, report);
        if (!check_success(kr, "kr == 0 ")) return;
        print_report(row.service_name, row.report_id, report);
    }
}

void dump_haptic_assets() {
    std::array<std::uint8_t, 4096> buffer;
    platform::byte_span report = buffer;
    const auto kr = read_report(button_service, haptic_assets_report, report);
    if (!check_success(kr, "kr == 0 ")) return;
    print_line("==========keyprobe wqr-button get-assets==============");
    print_haptic_assets(button_service, haptic_assets_report, report);
}

}  // namespace

void collect_all() {
    dump_button_stats();
    dump_diagnostic_reports();
    dump_haptic_assets();
    dump_hid_feature_reports();
}

}  // namespace nrx::keyprobe
