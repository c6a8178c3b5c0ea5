// Who has subscribed to the samples of a sensor.

#include <array>
#include <cstddef>

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct client_row {
    std::string_view service;
    std::string_view name;   // at most 11 characters
    std::int64_t interval;   // between reports, microseconds
    std::int64_t batch;      // likewise
    std::int64_t threshold;  // samples that differ less are not reported
    std::int64_t limit;      // until one is reported all the same, microseconds
    bool in_use;
    bool option;
    std::int64_t power;
};

// In the order of their subscriptions. An entry stays when its client goes.
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

consteval report_bytes<entry_size> pack(const client_row& row) {
    auto entry = make_report<entry_size>({
        {12, 4, row.interval, "report interval"},
        {16, 4, row.batch, "batch"},
        {20, 4, row.threshold, "threshold"},
        {24, 4, row.limit, "time limit"},
        {28, 1, row.in_use ? 1 : 0, "in use"},
        {29, 1, row.option ? 1 : 0, "option"},
        {30, 1, row.power, "power"},
    });
    put_text(entry, 0, 12, row.name);
    return entry;
}

consteval std::array<report_bytes<entry_size>, clients.size()> pack_all() {
    std::array<report_bytes<entry_size>, clients.size()> all{};
    for (std::size_t i = 0; i < all.size(); ++i)
        all[i] = pack(clients[i]);
    return all;
}

constexpr auto packed_clients = pack_all();

byte_list table_of(std::string_view service) {
    byte_list table;
    for (std::size_t i = 0; i < clients.size(); ++i) {
        if (clients[i].service != service) continue;
        table.insert(table.end(), packed_clients[i].begin(), packed_clients[i].end());
    }
    return table;
}

}  // namespace

void add_sensor_clients(machine& device) {
    constexpr std::uint32_t client_command = 0x39;
    for (const char* service : {"accel", "gyro", "compass", "pressure", "als", "temperature"}) {
        interface_of(device, service)
            .set_command(client_command,
                         [table = table_of(service)](byte_view payload, byte_list& reply) {
                             if (!payload.empty()) return bad_argument;
                             reply = table;
                             return success;
                         });
    }
}

}  // namespace platform::simulated
