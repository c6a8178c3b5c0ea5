// What the button tells about its last press and about itself.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

// The last press, a double click. Times are microseconds since the coprocessor started.
constexpr std::int64_t finger_on = 86'412'305'118;
constexpr std::int64_t finger_off = finger_on + 498'330;

struct click_row {
    std::int64_t down;
    std::int64_t up;
    std::int64_t down_latency;  // from button down until its asset plays
    std::int64_t up_latency;    // from button up until its asset plays
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
    {16, 4, fixed_point(0.8125), "press threshold"},
    {20, 4, fixed_point(0.6875), "release threshold"},
    {24, 4, fixed_point(0.03125), "noise floor"},
    {28, 4, 31'840, "detector baseline"},
    {32, 8, finger_off, "last event"},
    {40, 4, 2'964, "detector temperature, hundredths of a degree"},
    {44, 4, 0, "last error"},
});

constexpr auto calibration = make_report<32>({
    {0, 4, 2, "calibration revision"},
    {4, 4, 4, "detector channels"},
    {8, 4, fixed_point(1.015625), "gain, channel 1"},
    {12, 4, fixed_point(0.984375), "gain, channel 2"},
    {16, 4, fixed_point(1.0), "gain, channel 3"},
    {20, 4, fixed_point(1.0078125), "gain, channel 4"},
    {24, 4, -118, "offset"},
    {28, 4, 1, "calibration valid"},
});

constexpr std::array reports{
    service_report{"WQR_wqr-button", 0xd0, state},
    service_report{"WQR_wqr-button", 0xd1, calibration},
    service_report{"WQR_wqr-button", 0xd7, statistics},
};

}  // namespace

void add_button_reports(machine& device) {
    put_reports(device, reports);
}

}  // namespace platform::simulated
