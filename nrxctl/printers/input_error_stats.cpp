#include "nrxctl/printers/input_error_stats.h"

#include <array>

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/field_table.h"

namespace nrx {

namespace {

using enum field_kind;

constexpr std::array rows{
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
    .length = 64, .label_width = 36, .separator = "# ", .rows = rows};

}  // namespace

void print_input_error_stats(std::string_view service_name, std::int32_t /*report_id*/,
                             platform::byte_view report) {
    if (report.empty()) return;
    text_line heading;
    heading.text("=========== (input report) error stats for <service_id>: ");
    heading.text(service_name).text("===========\n");
    write_output(heading.view());
    print_fields(input_error_stats, report);
}

}  // namespace nrx
