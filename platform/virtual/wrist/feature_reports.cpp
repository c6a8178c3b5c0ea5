// The feature reports of the button's HID device; each begins with its identifier.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

namespace {

constexpr auto identity = make_report<20>({
    {0, 1, 0xe0, "report"},
    {1, 1, 3, "firmware version 3.1.12"},
    {2, 1, 1, ""},
    {3, 1, 12, ""},
    {4, 4, 0x0040, "service"},
    {8, 8, 0x4b50'4458'0000'2a17, "serial number"},
    {16, 4, 2, "hardware revision"},
});

constexpr auto mode = make_report<8>({
    {0, 1, 0xb4, "report"},
    {1, 1, 1, "detector on"},
    {2, 1, 1, "haptics on"},
    {3, 1, 1, "speed: medium"},
    {4, 4, 3'600, "scan interval, microseconds"},
});

constexpr auto thresholds = make_report<17>({
    {0, 1, 0xe1, "report"},
    {1, 4, fixed_point(0.8125), "press"},
    {5, 4, fixed_point(0.6875), "release"},
    {9, 4, fixed_point(1.25), "deep press"},
    {13, 4, fixed_point(1.125), "deep release"},
});

constexpr auto channels = make_report<33>({
    {0, 1, 0xe2, "report"},
    {1, 4, 31'840, "baseline, channel 1"},
    {5, 4, 31'792, "baseline, channel 2"},
    {9, 4, 31'911, "baseline, channel 3"},
    {13, 4, 31'856, "baseline, channel 4"},
    {17, 4, 31'838, "last scan, channel 1"},
    {21, 4, 31'795, "last scan, channel 2"},
    {25, 4, 31'909, "last scan, channel 3"},
    {29, 4, 31'857, "last scan, channel 4"},
});

constexpr auto presses = make_report<16>({
    {0, 1, 0xe3, "report"},
    {1, 1, 2, "clicks of the last press"},
    {4, 4, 1'847, "presses since start"},
    {8, 4, 2, "rejected presses since start"},
    {12, 4, 498'330, "duration of the last press, microseconds"},
});

constexpr auto errors = make_report<12>({
    {0, 1, 0xe4, "report"},
    {1, 1, 0, "last error"},
    {4, 4, 1, "detector restarts since start"},
    {8, 4, 0, "scans overrun since start"},
});

struct feature_row {
    std::uint8_t id;
    byte_view bytes;
};

constexpr std::array features{
    feature_row{0xe0, identity}, feature_row{0xb4, mode},    feature_row{0xe1, thresholds},
    feature_row{0xe2, channels}, feature_row{0xe3, presses}, feature_row{0xe4, errors},
};

}  // namespace

void add_feature_reports(machine& device) {
    const entry_ref button = device.find("wqr-button-hid");
    for (const feature_row& row : features) {
        button->hid->set_feature_report(row.id, {row.bytes.begin(), row.bytes.end()});
    }
}

}  // namespace platform::simulated
