// What the services besides the button tell about themselves.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

constexpr auto actuator = make_report<40>({
    {0, 4, 0x00'01'04'02, "firmware version 1.4.2"},
    {4, 4, 1, "state: ready"},
    {8, 4, 3'702, "assets played since start"},
    {12, 4, 0, "assets cut off since start"},
    {16, 4, fixed_point(156.25), "resonance, hertz"},
    {20, 4, fixed_point(8.0625), "coil resistance, ohms"},
    {24, 4, 3'120, "coil temperature, hundredths of a degree"},
    {28, 4, 3'846, "supply, millivolts"},
    {32, 8, 86'412'758'202, "last asset played, microseconds"},
});

constexpr auto bottom_speaker = make_report<32>({
    {0, 4, 0x00'02'00'07, "firmware version 2.0.7"},
    {4, 4, 0, "state: idle"},
    {8, 4, 214, "tones played since start"},
    {12, 4, 1, "tones cut off since start"},
    {16, 4, fixed_point(0.75), "volume"},
    {20, 4, 3'045, "coil temperature, hundredths of a degree"},
    {24, 8, 86'398'114'690, "last tone played, microseconds"},
});

constexpr auto scan_state = make_report<40>({
    {0, 4, fixed_point(0.0625), "accelerometer variance threshold"},
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

// The multiplexer's lines, as it saw them change.
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
        put_number(bytes, offset, 8, row.time);
        put_number(bytes, offset + 8, 4, row.data);
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

constexpr std::array reports{
    service_report{"arc", 0xd0, actuator},       service_report{"btmspk", 0xd0, bottom_speaker},
    service_report{"morvane", 0xd0, scan_state}, service_report{"mux", 0xd0, data_log},
    service_report{"mux", 0xd1, multiplexer},    service_report{"baseband", 0xd0, link_counters},
};

}  // namespace

void add_diagnostic_reports(machine& device) {
    put_reports(device, reports);
}

}  // namespace platform::simulated
