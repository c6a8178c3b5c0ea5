// What went wrong on the way of the samples: on the buses, and in the reports sent on.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct input_row {
    std::string_view service;
    std::int64_t received;  // packets by the coprocessor
    std::int64_t drops;     // for a bad checksum, or for want of room
    std::int64_t duplicates;
    std::int64_t cached;  // not yet sent on
    std::int64_t checksum_errors;
    std::int64_t not_ready;  // the status errors that happen at all
    std::int64_t io_errors;
    std::int64_t resets;  // since boot
};

constexpr std::array inputs{
    input_row{"accel", 8'641'230, 12, 4, 3, 2, 5, 1, 1},
    input_row{"gyro", 8'640'877, 6, 2, 0, 0, 3, 0, 1},
    input_row{"compass", 864'115, 1, 0, 2, 1, 2, 0, 1},
    input_row{"WQR_wqr-button", 14'806, 0, 0, 0, 0, 0, 0, 0},
};

consteval report_bytes<64> pack(const input_row& row) {
    return make_report<64>({
        {0, 4, row.drops, "packet drops"},
        {4, 4, row.not_ready + row.io_errors, "status errors"},
        {12, 4, row.not_ready, "status: not ready"},
        {28, 4, row.io_errors, "status: i/o error"},
        {36, 4, row.checksum_errors, "checksum errors"},
        {40, 4, row.received, "packets received by the coprocessor"},
        {44, 4, row.received - row.drops - row.duplicates - row.cached, "packets sent on"},
        {48, 4, row.resets, "resets since boot"},
        {52, 4, row.duplicates, "duplicate packets dropped"},
        {60, 4, row.cached, "cached packets"},
    });
}

constexpr std::array input_statistics{pack(inputs[0]), pack(inputs[1]), pack(inputs[2]),
                                      pack(inputs[3])};
static_assert(input_statistics.size() == inputs.size());

struct bus_row {
    std::string_view name;  // at most 7 characters
    std::int64_t reads;
    std::int64_t read_errors;
    std::int64_t writes;
    std::int64_t write_errors;
    std::int64_t others;
    std::int64_t other_errors;
};

constexpr std::array buses{
    bus_row{"spi0", 17'282'107, 3, 42'118, 0, 96, 0}, bus_row{"spi1", 14'806, 0, 1'204, 0, 12, 0},
    bus_row{"i2c0", 1'728'230, 11, 9'377, 2, 310, 1}, bus_row{"i2c1", 86'412, 0, 640, 0, 8, 0},
    bus_row{"uart0", 2'254, 3, 15'940, 0, 1, 0},
};

constexpr std::size_t bus_row_size = 32;

consteval report_bytes<buses.size() * bus_row_size> pack_buses() {
    report_bytes<buses.size() * bus_row_size> bytes{};
    std::size_t offset = 0;
    for (const bus_row& row : buses) {
        const std::array counts{row.reads,        row.read_errors, row.writes,
                                row.write_errors, row.others,      row.other_errors};
        for (std::size_t i = 0; i < counts.size(); ++i) {
            put_number(bytes, offset + 4 * i, 4, counts[i]);
        }
        put_text(bytes, offset + 24, 8, row.name);
        offset += bus_row_size;
    }
    return bytes;
}

constexpr auto transfer_errors = pack_buses();

constexpr std::array reports{
    service_report{inputs[0].service, 0xe3, input_statistics[0]},
    service_report{inputs[1].service, 0xe3, input_statistics[1]},
    service_report{inputs[2].service, 0xe3, input_statistics[2]},
    service_report{inputs[3].service, 0xe3, input_statistics[3]},
    service_report{"mux", 0x45, transfer_errors},
};

}  // namespace

void add_error_statistics(machine& device) {
    put_reports(device, reports);
}

}  // namespace platform::simulated
