#include "nrxctl/printers/button_stats.h"

#include <array>

#include "nrxctl/printers/field_table.h"

namespace nrx {

namespace {

using enum field_kind;

constexpr std::array rows{
    field_row{"kpdx_stats"},
    field_row{"-- Last Button Press --"},
    field_row{"Click Count", u32_above_bit0, 233},
    field_row{"Finger ON Timestamp", u64, 0, " us"},
    field_row{"Start Haptics Timestamp", u64, 16, " us"},
    field_row{"Latency - Finger Detect to Button Down", u64, 24, " us"},
    field_row{"--Click 1--"},
    field_row{"Latency   - Button Down to Play Asset", u64, 184, " us"},
    field_row{"Timestamp - Button Down", u64, 88, " us"},
    field_row{"Timestamp - Button Down Play Asset", u64, 136, " us"},
    field_row{"Latency   - Button Up to Play Asset", u64, 192, " us"},
    field_row{"Timestamp - Button Up", u64, 96, " us"},
    field_row{"Timestamp - Button Up Play Asset", u64, 144, " us"},
    field_row{"--Click 2--"},
    field_row{"Latency   - Button Down to Play Asset", u64, 200, " us"},
    field_row{"Timestamp - Button Down", u64, 104, " us"},
    field_row{"Timestamp - Button Down Play Asset", u64, 152, " us"},
    field_row{"Latency   - Button Up to Play Asset", u64, 208, " us"},
    field_row{"Timestamp - Button Up", u64, 112, " us"},
    field_row{"Timestamp - Button Up Play Asset", u64, 160, " us"},
    field_row{"Second scan delta from FD", u64_minus, 266, " us", 0},
    field_row{"Num dorran Scans", u32, 274},
    field_row{"Num brevo Scans", u32, 278},
    field_row{"Finger OFF Timestamp", u64, 8, " us"},
    field_row{""},
    field_row{""},
    field_row{""},
};

constexpr field_table button_stats{
    .length = 282, .label_width = 58, .separator = ": ", .rows = rows};

}  // namespace

void print_button_stats(std::string_view /*service_name*/, std::int32_t /*report_id*/,
                        platform::byte_view report) {
    if (!report.empty()) print_fields(button_stats, report);
}

}  // namespace nrx
