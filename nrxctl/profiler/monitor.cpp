#include "nrxctl/profiler/monitor.h"

#include <chrono>
#include <limits>
#include <string>

#include "nrxctl/base/check.h"
#include "nrxctl/base/clock_references.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/base/profile_record.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "platform/clock.h"

namespace nrx {

namespace {

constexpr std::uint8_t end_marker_type = 0;
constexpr std::chrono::microseconds grace_period{100'000};

constexpr std::uint32_t microseconds_per_millisecond = 1'000;
constexpr std::uint32_t max_milliseconds =
    std::numeric_limits<std::uint32_t>::max() / microseconds_per_millisecond;

void print_args(const monitor_args& args) {
    text_line line;
    // The number is printed as a signed one; a long duration is thus negative.
    line.text("duration=").number(static_cast<std::int32_t>(args.duration));
    line.text(" us mode=").text(args.duration != 0 ? "enable" : "auto");
    line.text(" (humanReadable=").text(args.human ? "enabled" : "disabled").text(")");
    print_line(line.view());
}

// Returns true if a monitor that started at the given ticks has exceeded its duration.
bool has_expired(std::uint32_t duration, std::uint64_t start) {
    constexpr double microseconds = 1e6;
    const double elapsed = static_cast<double>(platform::ticks() - start) * tick_period;
    return duration != 0 && elapsed > duration / microseconds;
}

platform::return_code dequeue_record(const platform::mapped_memory& queue, profile_record& record) {
    record.bytes = {};
    platform::byte_span entry = record.bytes;
    const platform::return_code kr = platform::dequeue(queue, entry);
    if (check_success(kr, condition::kr_is_zero)) check_length(entry, profile_record_size);
    return kr;
}

// Prints records until the stream has ended or the duration has expired. Returns false with a
// failure report if the queue fails.
bool print_stream(const profiler_conn& conn, std::uint32_t duration, std::uint64_t start,
                  record_printer print) {
    bool ended = false;
    while (true) {
        platform::return_code kr = drain_profile_queue(conn.queue(), ended, print);
        if (!check_success(kr, condition::kr_is_zero)) return false;
        if (ended || has_expired(duration, start)) return true;
        flush_output();
        kr = platform::wait_for_data(conn.queue(), conn.port());
        if (!check_success(kr, condition::kr_is_zero)) return false;
    }
}

void print_remaining(const profiler_conn& conn, record_printer print) {
    flush_output();
    platform::sleep(grace_period);
    bool ended = false;
    drain_profile_queue(conn.queue(), ended, print);
    read_profile_records(print);
    print_line("done");
}

}  // namespace

std::uint32_t parse_duration(std::string_view argument) {
    if (argument == auto_keyword) return 0;
    const explanation_scope scope([&](explanation& given) {
        given = {quoted(argument) + " is not a duration",
                 "expected auto, or milliseconds from 0 to " + std::to_string(max_milliseconds)};
    });
    return parse_number_up_to(max_milliseconds, argument, "duration parameter is invalid") *
           microseconds_per_millisecond;
}

monitor_args parse_monitor_args(argument_cursor& arguments) {
    monitor_args args;
    auto argument = arguments.next();
    args.human = argument == human_keyword;
    if (args.human) argument = arguments.next();
    if (argument) args.duration = parse_duration(*argument);
    print_args(args);
    return args;
}

bool monitor_profiler(std::uint32_t duration, record_printer print) {
    const limited_watch limited;
    profiler_conn conn;
    const std::uint64_t start = platform::ticks();
    const bool has_fw_profiler = fw_profiler_available();
    const bool success = conn.open_queue();
    if (!check(success, condition::success)) return false;
    if (has_fw_profiler) {
        const platform::return_code kr = set_monitor_duration(duration);
        if (!check_success(kr, condition::kr_is_zero)) return false;
    }
    if (!print_stream(conn, duration, start, print)) return false;
    print_remaining(conn, print);
    return true;
}

platform::return_code drain_profile_queue(const platform::mapped_memory& queue, bool& ended,
                                          record_printer print) {
    while (platform::data_available(queue)) {
        profile_record record;
        const platform::return_code kr = dequeue_record(queue, record);
        if (kr != platform::success) return kr;
        if (record.type() == end_marker_type) {
            ended = true;
            break;
        }
        print(record);
    }
    return platform::success;
}

}  // namespace nrx
