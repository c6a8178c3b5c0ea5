// The button: its reports, its vibration patterns, and the feature reports of its HID device.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

namespace {

// --- statistics, state and calibration ---

// The last press, a double click. Times are microseconds since the coprocessor started.
constexpr std::int64_t finger_on = 86'412'305'118;
constexpr std::int64_t finger_off = finger_on + 498'330;

struct click_row {
    std::int64_t down;
    std::int64_t up;
    std::int64_t down_latency;  // from button down to its asset
    std::int64_t up_latency;    // from button up to its asset
};

constexpr click_row first{finger_on + 41'260, finger_on + 159'475, 1'932, 2'014};
constexpr click_row second{finger_on + 322'708, finger_on + 451'096, 1'957, 1'988};

constexpr auto statistics = make_report<282>({
    {0, 8, finger_on, "finger on"},
    {8, 8, finger_off, "finger off"},
    {16, 8, first.down + 312, "start of haptics"},
    {24, 8, first.down - finger_on, "latency, finger detect to button down"},
    {88, 8, first.down, "click 1: button down"},
    {96, 8, first.up, "click 1: button up"},
    {104, 8, second.down, "click 2: button down"},
    {112, 8, second.up, "click 2: button up"},
    {136, 8, first.down + first.down_latency, "click 1: asset for button down"},
    {144, 8, first.up + first.up_latency, "click 1: asset for button up"},
    {152, 8, second.down + second.down_latency, "click 2: asset for button down"},
    {160, 8, second.up + second.up_latency, "click 2: asset for button up"},
    {184, 8, first.down_latency, "click 1: latency, button down to asset"},
    {192, 8, first.up_latency, "click 1: latency, button up to asset"},
    {200, 8, second.down_latency, "click 2: latency, button down to asset"},
    {208, 8, second.up_latency, "click 2: latency, button up to asset"},
    {233, 4, 2 << 1 | 1, "click count in bits 1 to 31; bit 0: press complete"},
    {266, 8, finger_on + 3'612, "second scan"},
    {274, 4, 11, "dorran scans"},
    {278, 4, 127, "brevo scans"},
});

constexpr auto state = make_report<48>({
    {0, 4, 0x00'03'01'0c, "firmware version 3.1.12"},
    {4, 4, 3, "detector state: armed"},
    {8, 4, 1'847, "presses since start"},
    {12, 4, 2, "rejected presses since start"},
    {16, 4, q16_16(0.8125), "press threshold"},
    {20, 4, q16_16(0.6875), "release threshold"},
    {24, 4, q16_16(0.03125), "noise floor"},
    {28, 4, 31'840, "detector baseline"},
    {32, 8, finger_off, "last event"},
    {40, 4, 2'964, "detector temperature, hundredths of a degree"},
    {44, 4, 0, "last error"},
});

constexpr auto calibration = make_report<32>({
    {0, 4, 2, "calibration revision"},
    {4, 4, 4, "detector channels"},
    {8, 4, q16_16(1.015625), "gain, channel 1"},
    {12, 4, q16_16(0.984375), "gain, channel 2"},
    {16, 4, q16_16(1.0), "gain, channel 3"},
    {20, 4, q16_16(1.0078125), "gain, channel 4"},
    {24, 4, -118, "offset"},
    {28, 4, 1, "calibration valid"},
});

// --- haptic assets ---

struct asset_row {
    std::string_view speed;  // speed and event document the table; only the order of rows counts
    std::string_view event;
    bool enabled;
    double gain;
    std::int64_t min;  // duration of the press that plays the asset, microseconds
    std::int64_t max;
    std::int64_t slot;  // in the actuator's memory; -1: none
};

// 17 events for each of three speeds.
constexpr std::array assets{
    asset_row{"Slow", "SingleDown", true, 1, 250'000, 2'000'000, 0},
    asset_row{"Slow", "SingleUp", true, 0.9375, 250'000, 2'000'000, 1},
    asset_row{"Slow", "DoubleDown", true, 1, 250'000, 2'000'000, 2},
    asset_row{"Slow", "DoubleUp", true, 0.9375, 250'000, 2'000'000, 3},
    asset_row{"Slow", "TripleDown", true, 1, 250'000, 2'000'000, 4},
    asset_row{"Slow", "TripleUp", true, 0.9375, 250'000, 2'000'000, 5},
    asset_row{"Slow", "SingleTapOn", false, 0, 0, 0, -1},
    asset_row{"Slow", "SingleTapOff", false, 0, 0, 0, -1},
    asset_row{"Slow", "DoubleTapOn", false, 0, 0, 0, -1},
    asset_row{"Slow", "DoubleTapOff", false, 0, 0, 0, -1},
    asset_row{"Slow", "TripleTapOn", false, 0, 0, 0, -1},
    asset_row{"Slow", "TripleTapOff", false, 0, 0, 0, -1},
    asset_row{"Slow", "DeepDown", true, 1.125, 250'000, 2'000'000, 6},
    asset_row{"Slow", "DeepUp", true, 1.0625, 250'000, 2'000'000, 7},
    asset_row{"Slow", "LongPress", true, 1.25, 2'000'000, 10'000'000, 8},
    asset_row{"Slow", "LongPressUp", true, 0.875, 2'000'000, 10'000'000, 9},
    asset_row{"Slow", "Spare", false, 0, 0, 0, -1},
    asset_row{"Medium", "SingleDown", true, 1.0625, 110'000, 249'999, 10},
    asset_row{"Medium", "SingleUp", true, 1, 110'000, 249'999, 11},
    asset_row{"Medium", "DoubleDown", true, 1.0625, 110'000, 249'999, 12},
    asset_row{"Medium", "DoubleUp", true, 1, 110'000, 249'999, 13},
    asset_row{"Medium", "TripleDown", true, 1.0625, 110'000, 249'999, 14},
    asset_row{"Medium", "TripleUp", true, 1, 110'000, 249'999, 15},
    asset_row{"Medium", "SingleTapOn", false, 0, 0, 0, -1},
    asset_row{"Medium", "SingleTapOff", false, 0, 0, 0, -1},
    asset_row{"Medium", "DoubleTapOn", false, 0, 0, 0, -1},
    asset_row{"Medium", "DoubleTapOff", false, 0, 0, 0, -1},
    asset_row{"Medium", "TripleTapOn", false, 0, 0, 0, -1},
    asset_row{"Medium", "TripleTapOff", false, 0, 0, 0, -1},
    asset_row{"Medium", "DeepDown", true, 1.1875, 110'000, 249'999, 16},
    asset_row{"Medium", "DeepUp", true, 1.125, 110'000, 249'999, 17},
    asset_row{"Medium", "LongPress", true, 1.25, 2'000'000, 10'000'000, 18},
    asset_row{"Medium", "LongPressUp", true, 0.875, 2'000'000, 10'000'000, 19},
    asset_row{"Medium", "Spare", false, 0, 0, 0, -1},
    asset_row{"Fast", "SingleDown", true, 1.125, 0, 109'999, 20},
    asset_row{"Fast", "SingleUp", true, 1.0625, 0, 109'999, 21},
    asset_row{"Fast", "DoubleDown", true, 1.125, 0, 109'999, 22},
    asset_row{"Fast", "DoubleUp", true, 1.0625, 0, 109'999, 23},
    asset_row{"Fast", "TripleDown", true, 1.1875, 0, 109'999, 24},
    asset_row{"Fast", "TripleUp", true, 1.125, 0, 109'999, 25},
    asset_row{"Fast", "SingleTapOn", false, 0, 0, 0, -1},
    asset_row{"Fast", "SingleTapOff", false, 0, 0, 0, -1},
    asset_row{"Fast", "DoubleTapOn", false, 0, 0, 0, -1},
    asset_row{"Fast", "DoubleTapOff", false, 0, 0, 0, -1},
    asset_row{"Fast", "TripleTapOn", false, 0, 0, 0, -1},
    asset_row{"Fast", "TripleTapOff", false, 0, 0, 0, -1},
    asset_row{"Fast", "DeepDown", true, 1.25, 0, 109'999, 26},
    asset_row{"Fast", "DeepUp", true, 1.1875, 0, 109'999, 27},
    asset_row{"Fast", "LongPress", false, 0, 0, 0, -1},
    asset_row{"Fast", "LongPressUp", false, 0, 0, 0, -1},
    asset_row{"Fast", "Spare", false, 0, 0, 0, -1},
};
static_assert(assets.size() == 3 * 17);

constexpr std::size_t asset_size = 29;

consteval report_bytes<assets.size() * asset_size> pack_assets() {
    report_bytes<assets.size() * asset_size> bytes{};
    std::size_t offset = 0;
    for (const asset_row& row : assets) {
        store_number(bytes, offset, 1, row.enabled ? 1 : 0);
        store_number(bytes, offset + 1, 4, q16_16(row.gain));
        store_number(bytes, offset + 5, 8, row.min);
        store_number(bytes, offset + 13, 8, row.max);
        store_number(bytes, offset + 21, 4, row.slot);
        offset += asset_size;
    }
    return bytes;
}

constexpr auto asset_table = pack_assets();

constexpr std::array reports{
    service_report{"WQR_wqr-button", 0xd0, state},
    service_report{"WQR_wqr-button", 0xd1, calibration},
    service_report{"WQR_wqr-button", 0xd7, statistics},
    service_report{"WQR_wqr-button", 0xd8, asset_table},
};

// --- feature reports, each of which begins with its id ---

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
    {1, 4, q16_16(0.8125), "press"},
    {5, 4, q16_16(0.6875), "release"},
    {9, 4, q16_16(1.25), "deep press"},
    {13, 4, q16_16(1.125), "deep release"},
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

void add_button(machine& device) {
    add_reports(device, reports);
    const entry_ref button = device.find("wqr-button-hid");
    for (const feature_row& row : features) {
        button->hid->set_feature_report(row.id, {row.bytes.begin(), row.bytes.end()});
    }
}

}  // namespace platform::simulated
