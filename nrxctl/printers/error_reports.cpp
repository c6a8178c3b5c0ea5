#include "nrxctl/printers/error_reports.h"

#include <array>
#include <cstddef>

#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/field_table.h"

namespace nrx {

namespace {

using enum field_kind;

constexpr std::array input_error_rows{
    field_row{"_total_packets_nrx_received", u32, 40},
    field_row{"_total_packets_sent_to_ap", u32, 44},
    field_row{"_resets_since_boot", s32, 48},
    field_row{"_packet_drops", u32, 0},
    field_row{"_pt_invalid_packets(debug)", u32, 56},
    field_row{"_pt_cached_packets", u32, 60},
    field_row{"_duplicate_packet_drops", u32, 52},
    field_row{"_chksum_errors", u32, 36},
    field_row{""},
    field_row{"_total_status_errors", u32, 4},
    field_row{"  _status_IOReturnError", u32, 8},
    field_row{"  _status_IOReturnNotReady", u32, 12},
    field_row{"  _status_IOReturnNotPermitted", u32, 16},
    field_row{"  _status_IOReturnUnsupported", u32, 20},
    field_row{"  _status_IOReturnBadArgument", u32, 24},
    field_row{"  _status_IOReturnIOError", u32, 28},
    field_row{"  _status_IOReturnInternalError", u32, 32},
    field_row{""},
};

constexpr field_table input_error_stats{
    .length = 64, .label_width = 36, .separator = "# ", .rows = input_error_rows};

// A record of transfer errors.
constexpr std::size_t transfer_record_size = 32;
constexpr std::size_t name_offset = 24;
constexpr std::size_t max_name = 7;
constexpr std::size_t name_width = 15;

void print_transfer_record(platform::byte_view record) {
    const reply_fields fields(record);
    text_line line;
    line.pad_right(text_before_nul(record.subspan(name_offset, max_name)), name_width);
    line.text(" read_errors: ").number(fields.s32(4)).text("/").number(fields.s32(0));
    line.text(" write_errors: ").number(fields.s32(12)).text("/").number(fields.s32(8));
    line.text(" other_errors: ").number(fields.s32(20)).text("/").number(fields.s32(16));
    print_line(line.view());
}

}  // namespace

void print_input_error_stats(std::string_view service_name, report_id /*id*/,
                             platform::byte_view report) {
    if (report.empty()) return;
    text_line heading;
    heading.text("=========== (input report) error stats for <service_id>: ");
    heading.text(service_name).text("===========\n");
    write_output(heading.view());
    print_fields(input_error_stats, report);
}

void print_transfer_errors(std::string_view /*service_name*/, report_id /*id*/,
                           platform::byte_view report) {
    for_each_record(report, transfer_record_size, print_transfer_record);
}

}  // namespace nrx
