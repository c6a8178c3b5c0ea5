#include "nrxctl/printers/value_printers.h"

#include <algorithm>
#include <array>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

bool is_printable_or_space(std::uint8_t byte) {
    return (byte >= ' ' && byte <= '~') || (byte >= '\t' && byte <= '\r');
}

std::string_view as_text(platform::byte_view report) {
    return {reinterpret_cast<const char*>(report.data()), report.size()};
}

}  // namespace

void print_text_or_dump(std::string_view service_name, report_id id, platform::byte_view report) {
    if (report.empty()) return;
    const bool is_text = std::all_of(report.begin(), report.end() - 1, is_printable_or_space);
    is_text ? print_text(service_name, id, report) : hex_dump(report);
}

void print_hex(std::string_view /*service_name*/, report_id /*id*/, platform::byte_view report) {
    hex_dump(report);
}

void print_text(std::string_view /*service_name*/, report_id /*id*/, platform::byte_view report) {
    print_line(as_text(report));
}

void print_raw(std::string_view /*service_name*/, report_id /*id*/, platform::byte_view report) {
    write_output(as_text(report));
}

void print_u32(std::string_view /*service_name*/, report_id /*id*/, platform::byte_view report) {
    std::array<std::uint8_t, 4> word{};
    if (report.size() > word.size()) return;
    std::copy(report.begin(), report.end(), word.begin());
    print_line(text_line().number(load_le<std::uint32_t>(word.data())).view());
}

}  // namespace nrx
