#include "nrxctl/printers/report_printers.h"

#include <algorithm>
#include <array>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/printers/button_reports.h"
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

// Reports of one service, whose identifiers mean something else elsewhere.
struct service_printer {
    std::string_view service_name;
    report_id id;
    report_printer print;
};

constexpr std::array service_printers{
    service_printer{"wqr-button", 0xd7, print_button_stats},
    service_printer{"wqr-button", 0xd8, print_haptic_assets},
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

void print_service_report(std::string_view service_name, report_id id, platform::byte_view report) {
    const auto* row =
        std::find_if(service_printers.begin(), service_printers.end(), [&](const auto& candidate) {
            return candidate.service_name == service_name && candidate.id == id;
        });
    row == service_printers.end() ? print_report(service_name, id, report)
                                  : row->print(service_name, id, report);
}

}  // namespace nrx
