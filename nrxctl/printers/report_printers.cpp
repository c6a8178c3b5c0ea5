#include "nrxctl/printers/report_printers.h"

#include <algorithm>
#include <array>

#include "nrxctl/printers/diag_report.h"
#include "nrxctl/printers/input_error_stats.h"
#include "nrxctl/printers/sample_ranges.h"
#include "nrxctl/printers/transfer_errors.h"

namespace nrx {

namespace {

constexpr std::array ranges{
    report_printer_range{0x45, 0x45, print_transfer_errors},
    report_printer_range{0x53, 0x53, print_sample_ranges},
    report_printer_range{0xd0, 0xe2, print_diag_report},
    report_printer_range{0xe3, 0xe3, print_input_error_stats},
    report_printer_range{0xe4, 0xf7, print_diag_report},
};

}  // namespace

constinit const std::span<const report_printer_range> report_printers(ranges);

report_printer find_report_printer(std::int32_t report_id) {
    const auto range = std::find_if(
        report_printers.begin(), report_printers.end(), [&](const report_printer_range& candidate) {
            return report_id >= candidate.first && report_id <= candidate.last;
        });
    return range == report_printers.end() ? nullptr : range->print;
}

}  // namespace nrx
