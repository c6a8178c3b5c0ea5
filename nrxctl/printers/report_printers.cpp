#include "nrxctl/printers/report_printers.h"

#include <algorithm>
#include <array>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/printers/diag_report.h"
#include "nrxctl/printers/error_reports.h"
#include "nrxctl/printers/sample_ranges.h"

namespace nrx {

namespace {

struct printer_range {
    report_id first;
    report_id last;
    report_printer print;
};

constexpr std::array report_printers{
    printer_range{0x45, 0x45, print_transfer_errors},
    printer_range{0x53, 0x53, print_sample_ranges},
    printer_range{0xd0, 0xe2, print_diag_report},
    printer_range{0xe3, 0xe3, print_input_error_stats},
    printer_range{0xe4, 0xf7, print_diag_report},
};

}  // namespace

report_printer find_report_printer(report_id id) {
    const auto* range = std::find_if(report_printers.begin(), report_printers.end(),
                                     [&](const printer_range& candidate) {
                                         return id >= candidate.first && id <= candidate.last;
                                     });
    return range == report_printers.end() ? nullptr : range->print;
}

void print_report(std::string_view service_name, report_id id, platform::byte_view report) {
    const report_printer print = find_report_printer(id);
    print == nullptr ? hex_dump(report) : print(service_name, id, report);
}

}  // namespace nrx
