#include "nrxctl/printers/sample_ranges.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::array<std::string_view, 3> motion_sensors{"accel", "gyro", "compass"};
constexpr std::size_t record_size = 28;

struct axis_row {
    std::string_view label;
    std::size_t lowest;  // offsets of q16_16 values
    std::size_t highest;
};

constexpr std::array axes{axis_row{"x: ", 4, 8}, axis_row{"y: ", 12, 16}, axis_row{"z: ", 20, 24}};

void append_signed(text_line& line, double value) {
    line.text(value < 0 ? "" : "+").fixed(value, 6);
}

void print_ranges(platform::byte_view report) {
    check_length(report, record_size);
    const reply_fields fields(report);
    print_line(text_line().text("num_samples: ").number(fields.s32(0)).view());
    for (const axis_row& axis : axes) {
        text_line line;
        append_signed(line.text(axis.label), fields.s32(axis.lowest) / q16_16_one);
        append_signed(line.text(" - "), fields.s32(axis.highest) / q16_16_one);
        print_line(line.view());
    }
}

}  // namespace

void print_sample_ranges(std::string_view service_name, report_id /*id*/,
                         platform::byte_view report) {
    const bool is_motion_sensor = std::find(motion_sensors.begin(), motion_sensors.end(),
                                            service_name) != motion_sensors.end();
    is_motion_sensor ? print_ranges(report) : hex_dump(report);
}

}  // namespace nrx
