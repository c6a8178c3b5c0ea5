#include "nrxctl/profiler/statistics_tables.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/field_text.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/whole_records.h"

namespace nrx {

namespace {

constexpr std::size_t name_width = 16;
constexpr std::size_t number_width = 10;

constexpr std::size_t row_size = 64;
constexpr std::size_t thread_size = 36;

struct column {
    std::string_view heading;
    std::size_t offset;
    number_base base;
};

constexpr std::array columns{
    column{"eventsource", 36, number_base::hexadecimal},
    column{"function", 40, number_base::hexadecimal},
    column{"context", 44, number_base::hexadecimal},
    column{"count", 48, number_base::decimal},
    column{"total_time", 52, number_base::decimal},
    column{"max_time", 56, number_base::decimal},
    column{"max_latency", 60, number_base::decimal},
};

// In the firmware's own spelling.
constexpr std::array<std::string_view, 27> wake_reason_names{
    "nrx_none",
    "nrx",
    "nrx_queue_overflow_ep",
    "nrx_ferrin",
    "nrx_corvane",
    "nrx_activity_alarm",
    "nrx_sedintary_alarm",
    "nrx_gesture",
    "nrx_touch",
    "voice_trigger",
    "nrx_velm_reset",
    "audio",
    "nrx_aggregate_dictionary",
    "nrx_als",
    "nrx_reset_slave",
    "nrx_SCMHIDDebug",
    "nrx_READY",
    "nrx_rtp_hr",
    "nrx_rtp_tamo",
    "nrx_kpdx",
    "nrx_zarn_reset",
    "wqr_flapcase",
    "nrx_slave",
    "nrx_rtp_ctrl",
    "wqr_ttw",
    "wqr_pellix_unplug_detected",
    "nrx_unknown",
};
static_assert(wake_reason_names.size() * sizeof(std::uint32_t) == wake_requests_capacity);

// The name of a row's thread, as much of it as is shown.
std::string_view thread_of(platform::byte_view row) {
    return text_before_nul(row.first(std::min(thread_size, name_width)));
}

void print_row(platform::byte_view row) {
    text_line line;
    line.left(thread_of(row), name_width);
    for (const column& one : columns) {
        const std::uint32_t number = reply_fields(row).u32(one.offset);
        line.text(" ");
        if (one.base == number_base::hexadecimal) {
            line.hex(number, number_width);
        } else {
            line.number(number, number_width);
        }
    }
    print_line(line.view());
}

}  // namespace

void print_event_sources(platform::byte_view rows) {
    text_line header;
    header.left("thread", name_width);
    for (const column& one : columns)
        header.text(" ").left(one.heading, number_width);
    print_line(header.view());
    for_each_record(rows, row_size, print_row);
}

void print_wake_requests(platform::byte_view counts) {
    constexpr std::size_t count_size = sizeof(std::uint32_t);
    print_line(text_line().left("wake_reason", name_width).text(" wake_req_count ").view());
    for (const std::string_view reason : wake_reason_names) {
        if (counts.size() < count_size) return;
        text_line line;
        line.left(reason.substr(0, name_width), name_width).text(" ");
        line.hex(reply_fields(counts).u32(0), number_width).text(" ");
        print_line(line.view());
        counts = counts.subspan(count_size);
    }
}

}  // namespace nrx
