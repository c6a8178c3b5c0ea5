// Diagnostic reports of the services, and error statistics of the buses and of the packets
// forwarded.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

namespace {

// --- diagnostic reports ---

constexpr auto actuator = make_report<40>({
    {0, 4, 0x00'01'04'02, "firmware version 1.4.2"},
    {4, 4, 1, "state: ready"},
    {8, 4, 3'702, "assets played since start"},
    {12, 4, 0, "assets cut off since start"},
    {16, 4, q16_16(156.25), "resonance, hertz"},
    {20, 4, q16_16(8.0625), "coil resistance, ohms"},
    {24, 4, 3'120, "coil temperature, hundredths of a degree"},
    {28, 4, 3'846, "supply, millivolts"},
    {32, 8, 86'412'758'202, "last asset played, microseconds"},
});

constexpr auto bottom_speaker = make_report<32>({
    {0, 4, 0x00'02'00'07, "firmware version 2.0.7"},
    {4, 4, 0, "state: idle"},
    {8, 4, 214, "tones played since start"},
    {12, 4, 1, "tones cut off since start"},
    {16, 4, q16_16(0.75), "volume"},
    {20, 4, 3'045, "coil temperature, hundredths of a degree"},
    {24, 8, 86'398'114'690, "last tone played, microseconds"},
});

constexpr auto scan_state = make_report<40>({
    {0, 4, q16_16(0.0625), "accelerometer variance threshold"},
    {4, 4, 5, "frames until motion triggers"},
    {8, 4, 12, "frames to wait after a success"},
    {12, 8, 86'409'600'000, "last scan, microseconds"},
    {20, 4, 1'406, "frames since on the wrist"},
    {24, 4, 96, "low-fidelity reads"},
    {28, 4, 2, "scan state: waiting"},
    {32, 4, 10, "next scan, in units of 2.56 s"},
    {36, 4, 91, "low-fidelity scans accepted"},
});

constexpr auto link_counters = make_report<64>({
    {0, 4, 1, "resets"},
    {4, 8, 4'018'223, "last reset, microseconds"},
    {12, 4, 15'940, "packets sent: commands, responses, reports"},
    {16, 4, 412, "commands sent"},
    {20, 4, 388, "responses sent"},
    {24, 4, 15'140, "reports sent"},
    {28, 8, 86'411'902'377, "last sent, microseconds"},
    {36, 4, 2'251, "good packets received: commands, responses, reports"},
    {40, 4, 3, "bad packets received"},
    {44, 4, 388, "commands received"},
    {48, 4, 411, "responses received"},
    {52, 4, 1'452, "reports received"},
    {56, 8, 86'411'898'040, "last received, microseconds"},
});

struct log_row {
    std::int64_t time;  // microseconds
    std::int64_t data;
};

// Changes of the multiplexer's lines.
constexpr std::array line_changes{
    log_row{86'410'118'202, 0x01}, log_row{86'410'118'950, 0x03}, log_row{86'410'240'017, 0x02},
    log_row{86'411'760'408, 0x12}, log_row{86'411'761'155, 0x13}, log_row{86'412'305'004, 0x1b},
    log_row{86'412'803'561, 0x13},
};

constexpr std::size_t log_row_size = 12;

consteval report_bytes<line_changes.size() * log_row_size> pack_line_changes() {
    report_bytes<line_changes.size() * log_row_size> bytes{};
    std::size_t offset = 0;
    for (const log_row& row : line_changes) {
        store_number(bytes, offset, 8, row.time);
        store_number(bytes, offset + 8, 4, row.data);
        offset += log_row_size;
    }
    return bytes;
}

constexpr auto data_log = pack_line_changes();

constexpr auto multiplexer = make_report<16>({
    {0, 4, 0x13, "lines now"},
    {4, 4, 0x1f, "lines watched"},
    {8, 4, static_cast<std::int64_t>(line_changes.size()), "changes in the data log"},
    {12, 4, 0, "changes lost"},
});

// --- error statistics ---

struct input_row {
    std::string_view service;
    std::int64_t received;  // packets received by the coprocessor
    std::int64_t drops;     // bad checksum, or no buffer
    std::int64_t duplicates;
    std::int64_t cached;  // not forwarded yet
    std::int64_t checksum_errors;
    std::int64_t not_ready;  // status errors, as the next
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
        {44, 4, row.received - row.drops - row.duplicates - row.cached, "packets forwarded"},
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
            store_number(bytes, offset + 4 * i, 4, counts[i]);
        }
        store_text(bytes, offset + 24, 8, row.name);
        offset += bus_row_size;
    }
    return bytes;
}

constexpr auto transfer_errors = pack_buses();

constexpr std::array reports{
    service_report{"arc", 0xd0, actuator},
    service_report{"btmspk", 0xd0, bottom_speaker},
    service_report{"morvane", 0xd0, scan_state},
    service_report{"mux", 0xd0, data_log},
    service_report{"mux", 0xd1, multiplexer},
    service_report{"baseband", 0xd0, link_counters},
    service_report{"mux", 0x45, transfer_errors},
    service_report{inputs[0].service, 0xe3, input_statistics[0]},
    service_report{inputs[1].service, 0xe3, input_statistics[1]},
    service_report{inputs[2].service, 0xe3, input_statistics[2]},
    service_report{inputs[3].service, 0xe3, input_statistics[3]},
};

}  // namespace

void add_diagnostic_reports(machine& device) {
    add_reports(device, reports);
}

}  // namespace platform::simulated
