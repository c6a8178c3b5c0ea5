#include "nrxctl/inspection/motion_sensor.h"

#include <array>

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/sensor_reports.h"
#include "nrxctl/inspection/value_lists.h"

namespace nrx {

namespace {

void append_number(text_line& line, const sensor_reply& reply) {
    line.number(reply.s32());
}

void append_bandwidth(text_line& line, const sensor_reply& reply) {
    reply.is_set() ? line.number(reply.s32()) : line.text("auto");
}

void append_vector(text_line& line, const sensor_reply& reply) {
    append_fractions(line, reply, 0);
}

struct motion_row {
    std::string_view service_name;
    std::string_view label;
    sensor_report report;
    void (*append)(text_line& line, const sensor_reply& reply);
    std::string_view unread = {};  // stands in for a report that was not read
};

constexpr sensor_report full_scale{0x06, 4};
constexpr sensor_report full_scales{0x36, 128, 0, reply_extent::variable};
constexpr sensor_report bandwidth{0x04, 4};
constexpr sensor_report bandwidths{0x37, 128, 0, reply_extent::variable};
constexpr sensor_report sensitivity{0x1d, 36};
constexpr sensor_report compensation{0xd6, 12};

constexpr std::array motion_rows{
    motion_row{"accel", "fsr         : ", full_scale, append_number},
    motion_row{"accel", "SupportedFSR: ", full_scales, append_numbers},
    motion_row{"accel", "bw          : ", bandwidth, append_bandwidth},
    motion_row{"accel", "SupportedBW : ", bandwidths, append_numbers},
    motion_row{"gyro", "range       : ", full_scale, append_number},
    motion_row{"gyro", "SupportedRanges: ", full_scales, append_numbers},
    motion_row{"compass", "Sensitivity : ", sensitivity, append_matrix, "N/A"},
    motion_row{"compass", "Compensation: ", compensation, append_vector, "N/A"},
};

}  // namespace

void print_motion_sensor(std::string_view service_name) {
    for (const motion_row& row : motion_rows) {
        if (row.service_name != service_name) continue;
        text_line line;
        line.text(row.label);
        const sensor_reply reply = read_sensor_report(service_name, row.report);
        if (reply.was_read()) {
            row.append(line, reply);
        } else {
            line.text(row.unread);
        }
        print_line(line.view());
    }
}

}  // namespace nrx
