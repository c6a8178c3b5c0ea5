#include "nrxctl/inspection/perf_counters.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/field_text.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

namespace {

constexpr sensor_report mode_report{0x26, 4};
constexpr sensor_report counter_report{0x31, 256, 0, reply_extent::variable};
constexpr std::int32_t automatic_mode = 2;

// A count, then as many entries: a name, an s32, and twelve bytes that are not printed.
constexpr std::size_t header_size = 4;
constexpr std::size_t entry_size = 24;
constexpr std::size_t longest_name = 8;

void print_counters(platform::byte_view reply) {
    text_line line;
    line.text("APPerfmon   : ");
    check_length(reply, header_size);
    std::size_t count = reply_fields(reply).u32(0);
    platform::byte_view entries = reply.subspan(std::min(reply.size(), header_size));
    for (; count > 0 && entries.size() >= entry_size; --count) {
        line.text(text_before_nul(entries.first(longest_name))).text(": ");
        line.number(reply_fields(entries).s32(longest_name)).text(" ");
        entries = entries.subspan(entry_size);
    }
    print_line(line.view());
}

}  // namespace

void print_perf_counters(std::string_view service_name) {
    const sensor_reply mode = read_sensor_report(service_name, mode_report);
    if (!mode.was_read()) return print_line("APPerfmon   : perfmon is not supported");
    if (mode.s32() != automatic_mode) {
        return print_line("APPerfmon   : perfmon is not in auto mode");
    }
    const sensor_reply counters = read_sensor_report(service_name, counter_report);
    const platform::return_code kr = counters.result();
    if (check_success(kr, "kr == 0 ")) print_counters(counters.bytes());
}

}  // namespace nrx
