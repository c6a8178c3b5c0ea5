#include "nrxctl/printers/button_reports.h"

#include <array>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/name_table.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/field_table.h"

namespace nrx {

namespace {

using enum field_kind;

constexpr std::array button_stats_rows{
    field_row{"kpdx_stats"},
    field_row{"-- Last Button Press --"},
    field_row{"Click Count", u32_high_31_bits, 233},
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
    .length = 282, .label_width = 58, .separator = ": ", .rows = button_stats_rows};

constexpr std::array speed_rows{name_row{0, "Slow"}, name_row{1, "Medium"}, name_row{2, "Fast"}};
constexpr name_table speed_names(speed_rows);

constexpr std::array button_event_rows{
    name_row{0, "SingleDown"},   name_row{1, "SingleUp"},     name_row{2, "DoubleDown"},
    name_row{3, "DoubleUp"},     name_row{4, "TripleDown"},   name_row{5, "TripleUp"},
    name_row{6, "SingleTapOn"},  name_row{7, "SingleTapOff"}, name_row{8, "DoubleTapOn"},
    name_row{9, "DoubleTapOff"}, name_row{10, "TripleTapOn"}, name_row{11, "TripleTapOff"},
    name_row{12, "DeepDown"},    name_row{13, "DeepUp"},      name_row{14, "LongPress"},
    name_row{15, "LongPressUp"},
};
constexpr name_table button_event_names(button_event_rows);

// The haptic asset table: an entry for each event, speed by speed. The last event has no name.
constexpr std::uint32_t speeds = 3;
constexpr std::uint32_t events = 17;
constexpr std::size_t entry_size = 29;
constexpr std::size_t table_size = speeds * events * entry_size;

// Offsets inside an entry; the last four bytes are not printed.
constexpr std::size_t enable_offset = 0;  // u8, enabled unless 0
constexpr std::size_t gain_offset = 1;    // q16_16
constexpr std::size_t min_offset = 5;     // u64
constexpr std::size_t max_offset = 13;    // u64
constexpr std::size_t slot_offset = 21;   // s32

void print_asset(const reply_fields& fields, std::uint32_t speed, std::uint32_t event) {
    const std::size_t entry = (speed * events + event) * entry_size;
    text_line line;
    line.text("ASSET [").text(speed_names.name(speed)).text("][");
    line.text(button_event_names.name(event)).text("]: enable ");
    line.number(fields.u8(entry + enable_offset) != 0 ? 1 : 0);
    line.text(", slot ").number(fields.s32(entry + slot_offset));
    line.text(", gain ").general(fields.s32(entry + gain_offset) / q16_16_one);
    line.text(", min ").number(fields.u64(entry + min_offset));
    line.text(", max ").number(fields.u64(entry + max_offset));
    print_line(line.view());
}

}  // namespace

void print_button_stats(std::string_view /*service_name*/, report_id /*id*/,
                        platform::byte_view report) {
    if (!report.empty()) print_fields(button_stats, report);
}

void print_haptic_assets(std::string_view /*service_name*/, report_id /*id*/,
                         platform::byte_view report) {
    if (report.empty()) return;
    text_line line;
    line.text("Length: ").number(report.size()).text(", expected ").number(table_size);
    print_line(line.view());
    const reply_fields fields(report);
    for (std::uint32_t speed = 0; speed < speeds; ++speed) {
        for (std::uint32_t event = 0; event < events; ++event)
            print_asset(fields, speed, event);
    }
}

}  // namespace nrx
