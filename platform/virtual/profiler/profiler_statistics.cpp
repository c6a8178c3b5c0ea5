#include "platform/virtual/profiler/profiler_statistics.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "platform/virtual/little_endian.h"

namespace platform::simulated {

namespace {

using std::chrono::milliseconds;

struct event_source_row {
    std::string_view thread;
    std::uint32_t source;
    std::uint32_t function;
    std::uint32_t context;
    milliseconds interval;  // how often it fires
    std::uint32_t mean_time;
    std::uint32_t longest_time;
    std::uint32_t longest_latency;
};

constexpr std::array event_source_rows{
    event_source_row{"idle", 0x20004000, 0x08001048, 0x20004a00, milliseconds(50), 4, 11, 9},
    event_source_row{"sensor_hub", 0x20004180, 0x0800206c, 0x20004a40, milliseconds(10), 38, 212,
                     71},
    event_source_row{"sensor_hub", 0x20004198, 0x080020f4, 0x20004a80, milliseconds(20), 22, 97,
                     64},
    event_source_row{"motion_filter", 0x20004300, 0x08003110, 0x20004ac0, milliseconds(20), 164,
                     530, 118},
    event_source_row{"report_dispatcher", 0x20004480, 0x080041b8, 0x20004b00, milliseconds(100), 57,
                     301, 140},
    event_source_row{"button", 0x20004600, 0x08005020, 0x20004b40, milliseconds(2'560), 71, 96, 33},
    event_source_row{"profile", 0x20004780, 0x08006004, 0x20004b80, milliseconds(20), 12, 88, 45},
};

constexpr std::size_t row_size = 64;
constexpr std::size_t longest_thread_name = 35;

// How often each wake reason asks; 0: never.
constexpr std::array<std::uint32_t, 27> wake_seconds{0,  4, 0,  30, 45, 0, 0, 12, 3, 0, 0, 9, 60, 5,
                                                     90, 0, 20, 15, 0,  0, 0, 7,  0, 0, 0, 0, 120};

void put_row(const event_source_row& row, machine_clock::time counted, byte_span bytes) {
    const auto count = static_cast<std::uint32_t>(counted / row.interval);
    std::copy_n(row.thread.begin(), std::min(row.thread.size(), longest_thread_name),
                bytes.begin());
    put_le(bytes, 36, 4, row.source);
    put_le(bytes, 40, 4, row.function);
    put_le(bytes, 44, 4, row.context);
    put_le(bytes, 48, 4, count);
    put_le(bytes, 52, 4, count * row.mean_time);
    put_le(bytes, 56, 4, count > 0 ? row.longest_time : 0);
    put_le(bytes, 60, 4, count > 0 ? row.longest_latency : 0);
}

}  // namespace

std::vector<std::uint8_t> profiler_statistics::event_sources() const {
    std::vector<std::uint8_t> rows(event_source_rows.size() * row_size);
    const machine_clock::time counted = clock_.now() - cleared_;
    for (std::size_t i = 0; i < event_source_rows.size(); ++i) {
        put_row(event_source_rows[i], counted, byte_span(rows).subspan(i * row_size, row_size));
    }
    return rows;
}

std::vector<std::uint8_t> profiler_statistics::wake_requests() const {
    std::vector<std::uint8_t> counts(wake_seconds.size() * sizeof(std::uint32_t));
    for (std::size_t i = 0; i < wake_seconds.size(); ++i) {
        if (wake_seconds[i] == 0) continue;
        const auto count = clock_.now() / std::chrono::seconds(wake_seconds[i]);
        put_le(counts, i * sizeof(std::uint32_t), sizeof(std::uint32_t),
               static_cast<std::uint64_t>(count));
    }
    return counts;
}

}  // namespace platform::simulated
