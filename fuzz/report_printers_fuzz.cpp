// Report printers with arbitrary bytes. The first byte of the input chooses how the report is
// printed, the second the report identifier; then the service name up to a line feed, then the
// report.
#include <algorithm>
#include <array>
#include <cstdint>
#include <string_view>
#include <vector>

#include "fuzz/support/harness.h"
#include "nrxctl/printers/button_reports.h"
#include "nrxctl/printers/report_printers.h"
#include "nrxctl/printers/spi_status.h"
#include "nrxctl/printers/value_printers.h"

namespace {

void print_spi_status_report(std::string_view /*service_name*/, nrx::report_id /*id*/,
                             platform::byte_view report) {
    nrx::print_spi_status(report);
}

constexpr std::array<nrx::report_printer, 9> printers{
    nrx::print_report,       nrx::print_button_stats, nrx::print_haptic_assets,
    print_spi_status_report, nrx::print_hex,          nrx::print_text,
    nrx::print_raw,          nrx::print_u32,          nrx::print_text_or_dump,
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 2) return 0;
    const auto print = printers[data[0] % printers.size()];
    const auto text = fuzz::as_text(data + 2, size - 2);
    const auto service_name = text.substr(0, text.find('\n'));
    const std::size_t report_offset = std::min(size, 2 + service_name.size() + 1);
    // In an allocation of its own, so that a read beyond it is detected.
    const std::vector<std::uint8_t> report(data + report_offset, data + size);
    print(service_name, data[1], report);
    return 0;
}
