#include <array>
#include <cstdint>
#include <string_view>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/name_table.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

namespace {

constexpr std::size_t name_width = 16;
constexpr std::size_t number_width = 10;

// The statistics of one event source. A row on the wire is 64 bytes: the thread name, with a
// terminator if it is shorter than its field, then little-endian 32-bit numbers in the order of the
// members.
struct event_source_stats {
    static constexpr std::size_t wire_size = 64;
    static constexpr std::size_t thread_size = 36;

    std::string_view thread;  // refers to the row
    std::uint32_t event_source;
    std::uint32_t function;
    std::uint32_t context;
    std::uint32_t count;
    std::uint32_t total_time;
    std::uint32_t max_time;
    std::uint32_t max_latency;
};

constexpr std::size_t max_event_sources = 200;

event_source_stats decode_event_source(platform::byte_view row) {
    const reply_fields fields(row);
    return {
        .thread = text_before_nul(row.first(event_source_stats::thread_size)),
        .event_source = fields.u32(36),
        .function = fields.u32(40),
        .context = fields.u32(44),
        .count = fields.u32(48),
        .total_time = fields.u32(52),
        .max_time = fields.u32(56),
        .max_latency = fields.u32(60),
    };
}

struct column {
    std::string_view heading;
    std::uint32_t event_source_stats::*member;
    number_base base;
};

constexpr std::array columns{
    column{"eventsource", &event_source_stats::event_source, number_base::hexadecimal},
    column{"function", &event_source_stats::function, number_base::hexadecimal},
    column{"context", &event_source_stats::context, number_base::hexadecimal},
    column{"count", &event_source_stats::count, number_base::decimal},
    column{"total_time", &event_source_stats::total_time, number_base::decimal},
    column{"max_time", &event_source_stats::max_time, number_base::decimal},
    column{"max_latency", &event_source_stats::max_latency, number_base::decimal},
};

void print_event_source(const event_source_stats& stats) {
    text_line line;
    line.pad_right(stats.thread.substr(0, name_width), name_width);
    for (const auto& [heading, member, base] : columns) {
        line.text(" ");
        if (base == number_base::hexadecimal) {
            line.hex(stats.*member, number_width);
        } else {
            line.number(stats.*member, number_width);
        }
    }
    print_line(line.view());
}

// Prints a header, and a line for each complete row.
void print_event_sources(platform::byte_view rows) {
    text_line header;
    header.pad_right("thread", name_width);
    for (const column& column : columns)
        header.text(" ").pad_right(column.heading, number_width);
    print_line(header.view());
    for_each_record(rows, event_source_stats::wire_size,
                    [](platform::byte_view row) { print_event_source(decode_event_source(row)); });
}

// In the firmware's own spelling.
constexpr std::array wake_reason_rows{
    name_row{0, "nrx_none"},
    name_row{1, "nrx"},
    name_row{2, "nrx_queue_overflow_ep"},
    name_row{3, "nrx_ferrin"},
    name_row{4, "nrx_corvane"},
    name_row{5, "nrx_activity_alarm"},
    name_row{6, "nrx_sedintary_alarm"},
    name_row{7, "nrx_gesture"},
    name_row{8, "nrx_touch"},
    name_row{9, "voice_trigger"},
    name_row{10, "nrx_velm_reset"},
    name_row{11, "audio"},
    name_row{12, "nrx_aggregate_dictionary"},
    name_row{13, "nrx_als"},
    name_row{14, "nrx_reset_slave"},
    name_row{15, "nrx_SCMHIDDebug"},
    name_row{16, "nrx_READY"},
    name_row{17, "nrx_rtp_hr"},
    name_row{18, "nrx_rtp_tamo"},
    name_row{19, "nrx_kpdx"},
    name_row{20, "nrx_zarn_reset"},
    name_row{21, "wqr_flapcase"},
    name_row{22, "nrx_slave"},
    name_row{23, "nrx_rtp_ctrl"},
    name_row{24, "wqr_ttw"},
    name_row{25, "wqr_pellix_unplug_detected"},
    name_row{26, "nrx_unknown"},
};
constexpr name_table wake_reason_names(wake_reason_rows);

constexpr std::size_t wake_count_size = sizeof(std::uint32_t);
constexpr std::size_t wake_counts_size = wake_reason_rows.size() * wake_count_size;

void print_wake_request(std::string_view reason, std::uint32_t count) {
    text_line line;
    line.pad_right(reason.substr(0, name_width), name_width).text(" ");
    line.hex(count, number_width).text(" ");
    print_line(line.view());
}

// Prints a header, and a line for each complete count. The n-th count is that of wake reason n.
void print_wake_requests(platform::byte_view counts) {
    print_line(text_line().pad_right("wake_reason", name_width).text(" wake_req_count ").view());
    std::uint32_t reason = 0;
    for_each_record(counts, wake_count_size, [&](platform::byte_view count) {
        print_wake_request(wake_reason_names.name(reason++), reply_fields(count).u32(0));
    });
}

}  // namespace

void clear_event_source_statistics(argument_cursor& /*arguments*/) {
    const platform::return_code kr = clear_event_sources();
    check_success(kr, condition::kr_is_zero);
}

void show_event_sources(argument_cursor& /*arguments*/) {
    std::vector<std::uint8_t> buffer(max_event_sources * event_source_stats::wire_size);
    platform::byte_span rows = buffer;
    const platform::return_code kr = read_event_sources(rows);
    if (check_success(kr, condition::kr_is_zero)) print_event_sources(rows);
}

void show_wake_requests(argument_cursor& /*arguments*/) {
    std::array<std::uint8_t, wake_counts_size> buffer{};
    platform::byte_span counts = buffer;
    const platform::return_code kr = read_wake_requests(counts);
    if (check_success(kr, condition::kr_is_zero)) print_wake_requests(counts);
}

}  // namespace nrx::profile
