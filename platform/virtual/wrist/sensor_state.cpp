// The state of the sensors' parts, registers that is, and that of the processor that serves them.

#include <array>
#include <cstddef>

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct register_row {
    std::int64_t number;
    std::int64_t value;
};

template <std::size_t Count>
consteval report_bytes<4 + 4 * Count> registers(const register_row (&rows)[Count]) {
    report_bytes<4 + 4 * Count> bytes{};
    put_number(bytes, 0, 4, Count);
    for (std::size_t i = 0; i < Count; ++i) {
        put_number(bytes, 4 + 4 * i, 2, rows[i].number);
        put_number(bytes, 6 + 4 * i, 2, rows[i].value);
    }
    return bytes;
}

// Who it is, status, rate, range, queue, interrupts.
constexpr auto accel_registers =
    registers({{0x00, 0x16}, {0x02, 0x04}, {0x20, 0x97}, {0x21, 0x28}, {0x2e, 0x4c}, {0x36, 0x01}});
constexpr auto gyro_registers =
    registers({{0x00, 0x52}, {0x02, 0x04}, {0x20, 0x86}, {0x22, 0x0c}, {0x2e, 0x4c}});
constexpr auto compass_registers = registers({{0x00, 0x48d}, {0x10, 0x02}, {0x31, 0x08}});
constexpr auto pressure_registers = registers({{0xd0, 0x58}, {0xf3, 0x00}, {0xf4, 0x57}});

struct counter_row {
    std::string_view name;  // at most 7 characters
    std::int64_t value;     // mean over the passes
    std::int64_t lowest;
    std::int64_t highest;
    std::int64_t passes;
};

template <std::size_t Count>
consteval report_bytes<4 + 24 * Count> counters(const counter_row (&rows)[Count]) {
    report_bytes<4 + 24 * Count> bytes{};
    put_number(bytes, 0, 4, Count);
    for (std::size_t i = 0; i < Count; ++i) {
        const counter_row& row = rows[i];
        const std::size_t entry = 4 + 24 * i;
        put_text(bytes, entry, 8, row.name);
        put_number(bytes, entry + 8, 4, row.value);
        put_number(bytes, entry + 12, 4, row.lowest);
        put_number(bytes, entry + 16, 4, row.highest);
        put_number(bytes, entry + 20, 4, row.passes);
    }
    return bytes;
}

constexpr auto accel_counters = counters({
    {"cycles", 18'430, 11'207, 40'962, 1'600},
    {"insn", 12'844, 8'015, 27'440, 1'600},
    {"icmiss", 61, 12, 240, 1'600},
    {"dcmiss", 87, 20, 311, 1'600},
    {"stalls", 2'106, 904, 7'713, 1'600},
});
constexpr auto gyro_counters = counters({
    {"cycles", 16'902, 10'880, 38'417, 1'600},
    {"insn", 11'730, 7'864, 25'038, 1'600},
});

consteval report_bytes<4> mode(std::int64_t value) {
    return make_report<4>({{0, 4, value, "mode of the performance monitor"}});
}

constexpr auto monitor_is_manual = mode(1);
constexpr auto monitor_is_automatic = mode(2);

// The slow sensors have no performance monitor, and the light sensor lets nobody read registers.
constexpr std::array reports{
    service_report{"accel", 0x38, accel_registers},
    service_report{"accel", 0x26, monitor_is_automatic},
    service_report{"accel", 0x31, accel_counters},
    service_report{"gyro", 0x38, gyro_registers},
    service_report{"gyro", 0x26, monitor_is_automatic},
    service_report{"gyro", 0x31, gyro_counters},
    service_report{"compass", 0x38, compass_registers},
    service_report{"compass", 0x26, monitor_is_manual},
    service_report{"pressure", 0x38, pressure_registers},
};

}  // namespace

void add_sensor_state(machine& device) {
    put_reports(device, reports);
}

}  // namespace platform::simulated
