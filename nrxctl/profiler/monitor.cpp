#include "nrxctl/profiler/monitor.h"

#include <chrono>
#include <limits>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/profile_records.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/tick_period.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/profiler_conn.h"
#include "platform/clock.h"

namespace nrx {

namespace {

constexpr std::uint8_t end_marker_type = 0;
constexpr std::chrono::microseconds grace{100'000};

constexpr std::uint32_t milliseconds_to_microseconds = 1'000;
constexpr std::uint32_t longest_duration =
    std::numeric_limits<std::uint32_t>::max() / milliseconds_to_microseconds;

void announce(const monitor_args& args) {
    text_line line;
    // The number is written as a signed one, however long the duration.
    line.text("duration=").number(static_cast<std::int32_t>(args.duration));
    line.text(" us mode=").text(args.duration != 0 ? "enable" : "auto");
    line.text(" (humanReadable=").text(args.human ? "enabled" : "disabled").text(")");
    print_line(line.view());
}

// Whether a monitor that began at the given ticks has lasted longer than its duration.
bool is_over(std::uint32_t duration, std::uint64_t start) {
    constexpr double microseconds = 1e6;
    const double elapsed = static_cast<double>(platform::ticks() - start) * tick_period;
    return duration != 0 && elapsed > duration / microseconds;
}

platform::return_code take_record(const platform::mapped_memory& queue, profile_record& record) {
    record.bytes = {};
    platform::byte_span entry = record.bytes;
    const platform::return_code kr = platform::dequeue(queue, entry);
    if (check_success(kr, "kr == 0 ")) check_length(entry, profile_record_size);
    return kr;
}

// Prints until the stream has ended; false, with a failure report, if the queue fails.
bool print_stream(const profiler_conn& conn, std::uint32_t duration, std::uint64_t start,
                  record_printer print) {
    bool ended = false;
    while (true) {
        platform::return_code kr = drain_profile_queue(conn.queue(), ended, print);
        if (!check_success(kr, "kr == 0 ")) return false;
        if (ended || is_over(duration, start)) return true;
        kr = platform::wait_for_data(conn.queue(), conn.port());
        if (!check_success(kr, "kr == 0 ")) return false;
    }
}

void print_what_is_left(const profiler_conn& conn, record_printer print) {
    platform::sleep(grace);
    bool ended = false;
    drain_profile_queue(conn.queue(), ended, print);
    read_profile_records(print);
    print_line("done");
}

}  // namespace

std::uint32_t parse_duration(std::string_view word) {
    if (word == "auto") return 0;
    return parse_number_up_to(longest_duration, word, "duration parameter is invalid") *
           milliseconds_to_microseconds;
}

monitor_args parse_monitor_args(argument_words& words) {
    monitor_args args;
    auto word = words.take();
    args.human = word == "human";
    if (args.human) word = words.take();
    if (word) args.duration = parse_duration(*word);
    announce(args);
    return args;
}

bool monitor_profiler(std::uint32_t duration, record_printer print) {
    profiler_conn conn;
    const std::uint64_t start = platform::ticks();
    const bool coprocessor_too = fw_profiler_available();
    const bool success = conn.open_queue();
    if (!check(success, "success")) return false;
    if (coprocessor_too) {
        const platform::return_code kr = set_monitor_duration(duration);
        if (!check_success(kr, "kr == 0 ")) return false;
    }
    if (!print_stream(conn, duration, start, print)) return false;
    print_what_is_left(conn, print);
    return true;
}

platform::return_code drain_profile_queue(const platform::mapped_memory& queue, bool& ended,
                                          record_printer print) {
    while (platform::data_available(queue)) {
        profile_record record;
        const platform::return_code kr = take_record(queue, record);
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
