#include "nrxctl/printers/diag_report.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <optional>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/field_table.h"

namespace nrx {

namespace {

using enum field_kind;

constexpr std::array scan_state_rows{
    field_row{"scanState", u32, 28},
    field_row{"nextScan in", scan_periods, 32, " sec"},
    field_row{"numLoFiReads", u32, 24},
    field_row{"numFramesSinceOnWrist", u32, 20},
    field_row{"numLoFiScans_Accepted", u32, 36},
    field_row{"numLoFiScans_Rejected", u32_minus, 24, "", 36},
    field_row{""},
    field_row{"waitNumFramesAfterSuccess", u32, 8},
    field_row{"motionTriggerNumFrames", u32, 4},
    field_row{"accelVarThreshold", q16_16, 0},
    field_row{""},
};
constexpr field_table scan_state{
    .length = 40, .label_width = 31, .separator = ": ", .rows = scan_state_rows};

constexpr std::array link_counter_rows{
    field_row{"num_resets", u32, 0},
    field_row{"last_reset_ts", u64, 4},
    field_row{"num_packets_sent", u32, 12},
    field_row{"num_commands_sent", u32, 16},
    field_row{"num_responses_sent", u32, 20},
    field_row{"num_reports_sent", u32, 24},
    field_row{"last_send_ts", u64, 28},
    field_row{"num_good_packets_received", u32, 36},
    field_row{"num_bad_packets_received", u32, 40},
    field_row{"num_commands_recv", u32, 44},
    field_row{"num_responses_recv", u32, 48},
    field_row{"num_reports_recv", u32, 52},
    field_row{"last_recv_ts", u64, 56},
    field_row{""},
};
constexpr field_table link_counters{
    .length = 64, .label_width = 29, .separator = ": ", .rows = link_counter_rows};

void print_scan_state(platform::byte_view report) {
    print_fields(scan_state, report);
}

void print_link_counters(platform::byte_view report) {
    print_fields(link_counters, report);
}

// Records of 12 bytes: a timestamp (u64) and a data value (u32).
void print_data_log(platform::byte_view report) {
    constexpr std::size_t record_size = 12;
    text_line line;
    for_each_record(report, record_size, [&](platform::byte_view record) {
        const reply_fields fields(record);
        line.clear();
        line.text("data:").hex(fields.u32(8), 2).text(" timestamp:").number(fields.u64(0));
        print_line(line.view());
    });
}

// The layout of a service's reports.
struct service_layout {
    std::string_view service_name;
    std::optional<report_id> only_report;  // nullopt: every report
    void (*print)(platform::byte_view report);
};

constexpr std::array layouts{
    service_layout{"morvane", std::nullopt, print_scan_state},
    service_layout{"mux", 0xd0, print_data_log},
    service_layout{"baseband", 0xd0, print_link_counters},
};

}  // namespace

void print_diag_report(std::string_view service_name, report_id id, platform::byte_view report) {
    if (report.empty()) return;
    const auto* layout =
        std::find_if(layouts.begin(), layouts.end(), [&](const service_layout& candidate) {
            return candidate.service_name == service_name &&
                   candidate.only_report.value_or(id) == id;
        });
    layout == layouts.end() ? hex_dump(report) : layout->print(report);
}

}  // namespace nrx
