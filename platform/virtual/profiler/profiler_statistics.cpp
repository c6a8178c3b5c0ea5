#include "platform/virtual/profiler/profiler_statistics.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "platform/virtual/little_endian.h"

namespace platform::simulated {

namespace {

using std::chrono::milliseconds;

struct event_source_stats {
    std::string_view thread;
    std::uint32_t source;
    std::uint32_t function;
    std::uint32_t context;
    milliseconds interval;  // between two events
    std::uint32_t mean_time;
    std::uint32_t max_time;
    std::uint32_t max_latency;
};

constexpr std::array event_source_rows{
    event_source_stats{"idle", 0x20004000, 0x08001048, 0x20004a00, milliseconds(50), 4, 11, 9},
    event_source_stats{"sensor_hub", 0x20004180, 0x0800206c, 0x20004a40, milliseconds(10), 38, 212,
                       71},
    event_source_stats{"sensor_hub", 0x20004198, 0x080020f4, 0x20004a80, milliseconds(20), 22, 97,
                       64},
    event_source_stats{"motion_filter", 0x20004300, 0x08003110, 0x20004ac0, milliseconds(20), 164,
                       530, 118},
    event_source_stats{"report_dispatcher", 0x20004480, 0x080041b8, 0x20004b00, milliseconds(100),
                       57, 301, 140},
    event_source_stats{"button", 0x20004600, 0x08005020, 0x20004b40, milliseconds(2'560), 71, 96,
                       33},
    event_source_stats{"profile", 0x20004780, 0x08006004, 0x20004b80, milliseconds(20), 12, 88, 45},
};

constexpr std::size_t row_size = 64;
constexpr std::size_t max_thread_name = 35;

// Seconds between two requests of each wake reason; 0: none.
constexpr std::array<std::uint32_t, 27> wake_request_intervals{
    0, 4, 0, 30, 45, 0, 0, 12, 3, 0, 0, 9, 60, 5, 90, 0, 20, 15, 0, 0, 0, 7, 0, 0, 0, 0, 120};

void write_row(const event_source_stats& row, machine_clock::time elapsed, byte_span bytes) {
    const auto count = static_cast<std::uint32_t>(elapsed / row.interval);
    std::copy_n(row.thread.begin(), std::min(row.thread.size(), max_thread_name), bytes.begin());
    store_le(bytes, 36, 4, row.source);
    store_le(bytes, 40, 4, row.function);
    store_le(bytes, 44, 4, row.context);
    store_le(bytes, 48, 4, count);
    store_le(bytes, 52, 4, count * row.mean_time);
    store_le(bytes, 56, 4, count > 0 ? row.max_time : 0);
    store_le(bytes, 60, 4, count > 0 ? row.max_latency : 0);
}

}  // namespace

std::vector<std::uint8_t> profiler_statistics::event_sources() const {
    std::vector<std::uint8_t> rows(event_source_rows.size() * row_size);
    const machine_clock::time elapsed = clock_.now() - cleared_;
    for (std::size_t i = 0; i < event_source_rows.size(); ++i) {
        write_row(event_source_rows[i], elapsed, byte_span(rows).subspan(i * row_size, row_size));
    }
    return rows;
}

std::vector<std::uint8_t> profiler_statistics::wake_requests() const {
    std::vector<std::uint8_t> counts(wake_request_intervals.size() * sizeof(std::uint32_t));
    for (std::size_t i = 0; i < wake_request_intervals.size(); ++i) {
        if (wake_request_intervals[i] == 0) continue;
        const auto count = clock_.now() / std::chrono::seconds(wake_request_intervals[i]);
        store_le(counts, i * sizeof(std::uint32_t), sizeof(std::uint32_t),
                 static_cast<std::uint64_t>(count));
    }
    return counts;
}

}  // namespace platform::simulated
