#include "nrxctl/inspection/register_list.h"

#include <cstddef>
#include <cstdint>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

namespace {

constexpr sensor_report register_report{0x38, 1024, 0, reply_extent::variable};

// A count, then as many entries: a register and its value, u16 each.
constexpr std::size_t header_size = 4;
constexpr std::size_t entry_size = 4;
constexpr std::size_t value_offset = 2;
constexpr std::size_t digits = 2;  // at least

void append_registers(text_line& line, const sensor_reply& list) {
    const std::uint64_t count = list.number<std::uint32_t>();
    if (!check(list.bytes().size() >= header_size + count * entry_size,
               "size >= sizeof(NrxRegisterList) + list->count*sizeof(list->regs[0])")) {
        return;
    }
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = header_size + i * entry_size;
        line.text("R").zero_padded_hex(list.number<std::uint16_t>(entry), digits);
        line.text("=").zero_padded_hex(list.number<std::uint16_t>(entry + value_offset), digits);
        line.text(" ");
    }
}

}  // namespace

void print_register_list(std::string_view service_name) {
    const sensor_reply list = read_sensor_report(service_name, register_report);
    text_line line;
    line.text("SensorRegs  : ");
    if (list.was_read()) {
        append_registers(line, list);
    } else {
        line.text("<not supperted>");
    }
    print_line(line.view());
}

}  // namespace nrx
