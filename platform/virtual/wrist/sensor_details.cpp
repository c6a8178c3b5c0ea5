// What sensors report in detail: sample ranges, clients, registers, performance counters, and
// firmware information.

#include <array>
#include <cstddef>
#include <initializer_list>

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

namespace {

// --- sample ranges of the motion sensors ---

struct range {
    double min;
    double max;
};

consteval report_bytes<28> pack_ranges(std::int64_t samples, range x, range y, range z) {
    return make_report<28>({
        {0, 4, samples, "samples"},
        {4, 4, q16_16(x.min), "minimum x"},
        {8, 4, q16_16(x.max), "maximum x"},
        {12, 4, q16_16(y.min), "minimum y"},
        {16, 4, q16_16(y.max), "maximum y"},
        {20, 4, q16_16(z.min), "minimum z"},
        {24, 4, q16_16(z.max), "maximum z"},
    });
}

// In g, degrees per second and microteslas.
constexpr auto accel_samples =
    pack_ranges(2'048, {-0.34375, 0.40625}, {-0.5, 0.28125}, {-1.15625, -0.84375});
constexpr auto gyro_samples = pack_ranges(2'048, {-42.5, 38.25}, {-61.75, 57.125}, {-18.0, 22.875});
constexpr auto compass_samples =
    pack_ranges(205, {-24.5, -19.875}, {6.25, 11.5}, {-43.125, -38.75});

// --- registers and performance counters ---

struct register_row {
    std::int64_t number;
    std::int64_t value;
};

template <std::size_t Count>
consteval report_bytes<4 + 4 * Count> registers(const register_row (&rows)[Count]) {
    report_bytes<4 + 4 * Count> bytes{};
    store_number(bytes, 0, 4, Count);
    for (std::size_t i = 0; i < Count; ++i) {
        store_number(bytes, 4 + 4 * i, 2, rows[i].number);
        store_number(bytes, 6 + 4 * i, 2, rows[i].value);
    }
    return bytes;
}

// Identity, status, rate, range, queue, interrupts.
constexpr auto accel_registers =
    registers({{0x00, 0x16}, {0x02, 0x04}, {0x20, 0x97}, {0x21, 0x28}, {0x2e, 0x4c}, {0x36, 0x01}});
constexpr auto gyro_registers =
    registers({{0x00, 0x52}, {0x02, 0x04}, {0x20, 0x86}, {0x22, 0x0c}, {0x2e, 0x4c}});
constexpr auto compass_registers = registers({{0x00, 0x48d}, {0x10, 0x02}, {0x31, 0x08}});
constexpr auto pressure_registers = registers({{0xd0, 0x58}, {0xf3, 0x00}, {0xf4, 0x57}});

struct counter_row {
    std::string_view name;  // at most 7 characters
    std::int64_t value;     // mean over the passes
    std::int64_t min;
    std::int64_t max;
    std::int64_t passes;
};

template <std::size_t Count>
consteval report_bytes<4 + 24 * Count> counters(const counter_row (&rows)[Count]) {
    report_bytes<4 + 24 * Count> bytes{};
    store_number(bytes, 0, 4, Count);
    for (std::size_t i = 0; i < Count; ++i) {
        const counter_row& row = rows[i];
        const std::size_t entry = 4 + 24 * i;
        store_text(bytes, entry, 8, row.name);
        store_number(bytes, entry + 8, 4, row.value);
        store_number(bytes, entry + 12, 4, row.min);
        store_number(bytes, entry + 16, 4, row.max);
        store_number(bytes, entry + 20, 4, row.passes);
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

// The slow sensors have no performance monitor, and the registers of the light sensor cannot be
// read.
constexpr std::array reports{
    service_report{"accel", 0x53, accel_samples},
    service_report{"accel", 0x38, accel_registers},
    service_report{"accel", 0x26, monitor_is_automatic},
    service_report{"accel", 0x31, accel_counters},
    service_report{"gyro", 0x53, gyro_samples},
    service_report{"gyro", 0x38, gyro_registers},
    service_report{"gyro", 0x26, monitor_is_automatic},
    service_report{"gyro", 0x31, gyro_counters},
    service_report{"compass", 0x53, compass_samples},
    service_report{"compass", 0x38, compass_registers},
    service_report{"compass", 0x26, monitor_is_manual},
    service_report{"pressure", 0x38, pressure_registers},
};

// --- clients that have subscribed to samples ---

struct client_row {
    std::string_view service;
    std::string_view name;   // at most 11 characters
    std::int64_t interval;   // between reports, microseconds
    std::int64_t batch;      // microseconds
    std::int64_t threshold;  // samples that change by less are not reported
    std::int64_t limit;      // time after which a sample is reported anyway, microseconds
    bool in_use;
    bool option;
    std::int64_t power;
};

// In the order of subscription. The entry of a client that has left stays in the table.
constexpr std::array clients{
    client_row{"accel", "system", 10'000, 160'000, 0, 0, true, false, 3},
    client_row{"accel", "steps", 20'000, 1'000'000, 0, 0, true, true, 2},
    client_row{"accel", "replay", 10'000, 10'000, 0, 0, false, false, 3},
    client_row{"accel", "wrist_raise", 40'000, 40'000, 96, 2'000'000, true, true, 1},
    client_row{"gyro", "system", 10'000, 160'000, 0, 0, true, false, 11},
    client_row{"gyro", "gesture", 20'000, 20'000, 48, 1'000'000, true, true, 9},
    client_row{"compass", "system", 100'000, 1'000'000, 0, 0, true, false, 4},
    client_row{"pressure", "system", 1'000'000, 4'000'000, 0, 0, true, false, 1},
    client_row{"pressure", "elevation", 1'000'000, 4'000'000, 12, 60'000'000, true, true, 1},
    client_row{"als", "system", 250'000, 250'000, 5, 1'000'000, true, false, 2},
};

constexpr std::size_t entry_size = 31;

consteval report_bytes<entry_size> pack_client(const client_row& row) {
    auto entry = make_report<entry_size>({
        {12, 4, row.interval, "report interval"},
        {16, 4, row.batch, "batch"},
        {20, 4, row.threshold, "threshold"},
        {24, 4, row.limit, "time limit"},
        {28, 1, row.in_use ? 1 : 0, "in use"},
        {29, 1, row.option ? 1 : 0, "option"},
        {30, 1, row.power, "power"},
    });
    store_text(entry, 0, 12, row.name);
    return entry;
}

consteval std::array<report_bytes<entry_size>, clients.size()> pack_clients() {
    std::array<report_bytes<entry_size>, clients.size()> packed{};
    for (std::size_t i = 0; i < packed.size(); ++i)
        packed[i] = pack_client(clients[i]);
    return packed;
}

constexpr auto packed_clients = pack_clients();

byte_list client_table(std::string_view service) {
    byte_list table;
    for (std::size_t i = 0; i < clients.size(); ++i) {
        if (clients[i].service != service) continue;
        table.insert(table.end(), packed_clients[i].begin(), packed_clients[i].end());
    }
    return table;
}

void add_clients(const machine& device) {
    constexpr std::uint32_t client_command = 0x39;
    for (const char* service : {"accel", "gyro", "compass", "pressure", "als", "temperature"}) {
        interface_of(device, service)
            .set_command(client_command,
                         [table = client_table(service)](byte_view payload, byte_list& reply) {
                             if (!payload.empty()) return bad_argument;
                             reply = table;
                             return success;
                         });
    }
}

// --- firmware information: blocks of tagged items ---

struct info_item {
    std::uint8_t tag;
    std::size_t number_width = 0;  // in bytes
    std::int64_t number = 0;
    const char* text = nullptr;  // packed with its terminator
};

constexpr info_item number(std::int64_t value) {
    return {0, 4, value};
}
constexpr info_item long_number(std::int64_t value) {
    return {1, 8, value};
}
constexpr info_item text(const char* value) {
    return {2, 0, 0, value};
}
constexpr info_item line_break{3};
constexpr info_item in_hexadecimal{4};
constexpr info_item in_decimal{5};

byte_list pack_items(std::initializer_list<info_item> items) {
    byte_list block;
    for (const info_item& item : items) {
        block.push_back(item.tag);
        for (std::size_t i = 0; i < item.number_width; ++i)
            block.push_back(static_cast<std::uint8_t>(item.number >> (8 * i)));
        if (item.text == nullptr) continue;
        const std::string_view value(item.text);
        block.insert(block.end(), value.begin(), value.end());
        block.push_back(0);
    }
    return block;
}

void add_firmware_info(const machine& device) {
    interface_driver& accel = interface_of(device, "accel");
    accel.set_report(
        0x39, pack_items({text("queue "), number(16), text(" of 256, overruns "), number(0),
                          line_break, text("status 0x"), in_hexadecimal, number(0x2c04), in_decimal,
                          text(", self test "), number(-3), text(" mg")}));
    accel.set_report(0x3a,
                     pack_items({text("last sample "), long_number(86'412'305'118), text(" us")}));
    accel.set_report(0x3b,
                     pack_items({text("lot 0x"), in_hexadecimal, long_number(0x4b1d'20f7'0316),
                                 text(" die "), number(0xa7), in_decimal}));
    accel.set_report(0x3c, pack_items({text("shocks since start "), number(2)}));
    interface_driver& gyro = interface_of(device, "gyro");
    gyro.set_report(
        0x39, pack_items({text("queue "), number(16), text(" of 256, overruns "), number(1)}));
    gyro.set_report(
        0x3a, pack_items({text("drive "), number(1'412), text(" mV"), line_break, text("bias "),
                          number(18), text(" "), number(-7), text(" "), number(-31)}));
    interface_driver& compass = interface_of(device, "compass");
    compass.set_report(0x39, pack_items({text("set/reset "), number(864), line_break,
                                         text("field "), number(48'730), text(" nT")}));
    interface_of(device, "pressure")
        .set_report(0x39,
                    pack_items({text("oversampling "), number(8), text(", trim 0x"), in_hexadecimal,
                                number(0x6b43), text(" 0x"), number(0x67ed)}));
}

}  // namespace

void add_sensor_details(machine& device) {
    add_reports(device, reports);
    add_clients(device);
    add_firmware_info(device);
}

}  // namespace platform::simulated
