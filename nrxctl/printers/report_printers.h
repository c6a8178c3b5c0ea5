// Which printer prints a report.
#pragma once

#include <cstdint>
#include <span>

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// A range of report identifiers and their printer.
struct report_printer_range {
    std::int32_t first;
    std::int32_t last;
    report_printer print;
};

// The registered printers, by ascending identifier.
extern const std::span<const report_printer_range> report_printers;

// The printer registered for a report identifier; null for an identifier that has none.
report_printer find_report_printer(std::int32_t report_id);

}  // namespace nrx
