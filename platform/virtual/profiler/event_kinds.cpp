// The events of each component of the profiler, and the bodies of their records. Layouts by type:
//
//    1 long data     16 subtype u16, packet size u16, data length u16, data offset u16, 24 data
//    2 short data    16 subtype u16, 18 data
//    3 event         16 six u32 arguments
//    4 trigger       20 thread id u32
//    5 function      16 function, extra id, thread, duration, depth, thread duration, all u32
//    6, 7, 10        16 saved context
//    8 sensor info   16 report interval, batch interval, threshold, time limit u32; 32 connected,
//                    decimation, gyro power mode u8; 35 name, 12 characters
//    9 ext. function 16 task, thread, duration, argument u32; 32 name, 16 characters
//   11 annotation    16 global id u64, entry u64 or 8 characters, arguments u32, u32
//   12 decimation    16 next dispatch u64, sample, report, batch interval u32; 36 name, 12
//                    characters
//   13 wake request  16 reason u32, endpoint reference u64

#include <algorithm>
#include <array>
#include <string_view>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/event_record.h"

namespace platform::simulated {

namespace {

void store_text(byte_span record, std::size_t offset, std::string_view text) {
    std::copy(text.begin(), text.end(), record.begin() + static_cast<std::ptrdiff_t>(offset));
}

void store_words(byte_span record, const std::array<std::uint64_t, 6>& words) {
    for (std::size_t i = 0; i < words.size(); ++i) {
        store_le(record, 16 + 4 * i, 4, words[i]);
    }
}

// A value from min to min + range - 1 that varies with the number of the event.
constexpr std::uint64_t vary(std::uint64_t number, std::uint64_t min, std::uint64_t range) {
    return min + number * 37 % range;
}

constexpr std::uint64_t thread_address(std::uint64_t number) {
    return 0x2000'4000 + 0x180 * (number % 6);
}

void long_data(byte_span record, std::uint64_t number) {
    constexpr std::size_t max_bytes = 24;
    const std::uint64_t length = vary(number, 4, max_bytes - 3);
    store_le(record, 16, 2, number % 5);
    store_le(record, 18, 2, length);
    store_le(record, 20, 2, length);
    for (std::size_t i = 0; i < length; ++i) {
        store_le(record, 24 + i, 1, number * 3 + i);
    }
}

void short_data(byte_span record, std::uint64_t number) {
    store_le(record, 16, 2, number % 7);
    for (std::size_t i = 18; i < record.size(); ++i) {
        store_le(record, i, 1, number + 5 * i);
    }
}

void arguments(byte_span record, std::uint64_t number) {
    store_words(record, {number, thread_address(number), thread_address(number + 1),
                         vary(number, 3, 900), number % 4, vary(number, 20, 64)});
}

void trigger(byte_span record, std::uint64_t number) {
    store_le(record, 20, 4, thread_address(number));
}

void function(byte_span record, std::uint64_t number) {
    store_words(record, {0x0800'1000 + 0x24 * (number % 40), number % 3, thread_address(number),
                         vary(number, 5, 400), number % 8, vary(number, 400, 9000)});
}

void context(byte_span record, std::uint64_t number) {
    store_words(record,
                {0x0800'1000 + 4 * number, thread_address(number), number % 16, number, 0, 0});
}

void sensor_info(byte_span record, std::uint64_t number) {
    store_words(record, {10'000, 200'000, vary(number, 1, 64), 1'000'000, 0, 0});
    store_le(record, 32, 1, 1);
    store_le(record, 33, 1, 1 + number % 4);
    store_le(record, 34, 1, number % 3);
    store_text(record, 35, "client");
    store_le(record, 41, 1, '0' + number % 10);
}

void extended_function(byte_span record, std::uint64_t number) {
    store_words(record,
                {1 + number % 5, thread_address(number), vary(number, 8, 700), number, 0, 0});
    static constexpr std::array<std::string_view, 3> names{"dispatch_report", "pump_queue",
                                                           "step_filter"};
    store_text(record, 32, names[number % names.size()]);
}

void annotation(byte_span record, std::uint64_t number) {
    store_le(record, 16, 8, 0x1'0000'0000 + number);
    store_text(record, 24, "step");
    store_le(record, 28, 1, 'a' + number % 26);
    store_le(record, 32, 4, vary(number, 1, 100));
    store_le(record, 36, 4, number % 2);
}

void decimation(byte_span record, std::uint64_t number) {
    store_le(record, 16, 8, 2'500 * number);
    store_le(record, 24, 4, 1'250);
    store_le(record, 28, 4, 10'000);
    store_le(record, 32, 4, 200'000);
    store_text(record, 36, "motion");
}

// Samples of the three axes in fixed point, in multiples of unit: gravity on z, slight movement on
// x and y.
void store_samples(byte_span record, std::uint64_t number, std::uint64_t unit) {
    const std::uint64_t x = number % 64 * unit / 256;
    store_words(record, {x, 0 - x / 2, unit - unit / 128, number, vary(number, 100, 50), 3});
}

void samples_in(byte_span record, std::uint64_t number) {
    store_samples(record, number, 65'536);
}

void samples_out(byte_span record, std::uint64_t number) {
    store_samples(record, number, 4'096);
}

// The direction and the time of the bus controller.
void transfer(byte_span record, std::uint64_t number) {
    store_le(record, 16, 4, number % 2);
    store_le(record, 20, 8, 24'000 * number + 17);
}

void wake_statistics(byte_span record, std::uint64_t number) {
    store_words(record, {number % 27, number / 27 + 1, vary(number, 50, 400), 0, 0, 0});
}

void wake_request(byte_span record, std::uint64_t number) {
    store_le(record, 16, 4, number % 27);
    store_le(record, 20, 8, 0xffff'fff0'0000'0000 + 0x40 * (number % 12));
}

void wake_event(byte_span record, std::uint64_t number) {
    store_le(record, 16, 4, number % 27);
    store_le(record, 20, 4, 0x10 + number % 8);
}

constexpr std::uint32_t any = event_kind::any_component;
constexpr std::uint32_t all_reports = 0xffffffff;

constexpr std::uint32_t bit(unsigned n) {
    return std::uint32_t{1} << n;
}

// Category, component, report bits; event, type, body.
constexpr std::array event_table{
    // exec: scheduler, function, workloop, command, extfunction, timing
    event_kind{0, 0, all_reports, 0, 3, arguments},
    event_kind{0, 0, all_reports, 1, 3, arguments},
    event_kind{0, 0, all_reports, 2, 3, arguments},
    event_kind{0, 1, all_reports, 0, 5, function},
    event_kind{0, 2, all_reports, 0, 3, arguments},
    event_kind{0, 2, all_reports, 1, 3, arguments},
    event_kind{0, 3, bit(0), 0, 3, arguments},
    event_kind{0, 3, bit(1), 1, 3, arguments},
    event_kind{0, 3, bit(2), 2, 1, long_data},
    event_kind{0, 3, bit(3), 3, 2, short_data},
    event_kind{0, 3, bit(4), 4, 3, arguments},
    event_kind{0, 3, bit(5), 5, 1, long_data},
    event_kind{0, 3, bit(6), 6, 1, long_data},
    event_kind{0, 3, bit(7), 7, 2, short_data},
    event_kind{0, 4, all_reports, 0, 9, extended_function},
    event_kind{0, 5, all_reports, 0, 10, context},
    // trace
    event_kind{1, any, bit(0), 0, 6, context},
    event_kind{1, any, bit(1), 1, 7, context},
    event_kind{1, any, bit(2), 2, 3, arguments},
    // sensor
    event_kind{2, any, bit(0), 0, 3, arguments},
    event_kind{2, any, bit(1), 1, 2, short_data},
    event_kind{2, any, bit(2), 2, 2, short_data},
    event_kind{2, any, bit(3), 3, 2, short_data},
    event_kind{2, any, bit(4), 4, 1, long_data},
    event_kind{2, any, bit(5), 5, 3, arguments},
    event_kind{2, any, bit(6), 6, 3, arguments},
    event_kind{2, any, bit(7), 7, 3, arguments},
    event_kind{2, any, bit(8), 8, 2, short_data},
    event_kind{2, any, bit(9), 9, 8, sensor_info},
    event_kind{2, any, bit(10), 10, 11, annotation},
    event_kind{2, any, bit(11), 11, 12, decimation},
    event_kind{2, any, bit(16), 16, 4, trigger},
    event_kind{2, any, bit(17), 17, 4, trigger},
    event_kind{2, any, bit(18), 18, 3, arguments},
    event_kind{2, any, bit(19), 19, 4, trigger},
    // orrin
    event_kind{3, 0, bit(0), 0, 3, arguments},
    event_kind{3, 0, bit(1), 1, 2, short_data},
    event_kind{3, 0, bit(16), 17, 4, trigger},
    // talvor
    event_kind{4, 0, bit(0), 0, 3, samples_in},
    event_kind{4, 0, bit(1), 1, 3, samples_out},
    // interrupt
    event_kind{5, 0, bit(0), 0, 3, arguments},
    // uart
    event_kind{6, any, bit(0), 0, 3, arguments},
    event_kind{6, any, bit(1), 1, 3, arguments},
    event_kind{6, any, bit(2), 2, 3, arguments},
    event_kind{6, any, bit(3), 3, 2, short_data},
    event_kind{6, any, bit(4), 4, 1, long_data},
    event_kind{6, any, bit(5), 5, 1, long_data},
    event_kind{6, any, bit(6), 6, 1, long_data},
    event_kind{6, any, bit(7), 7, 11, annotation},
    // scm: one event per channel
    event_kind{9, any, bit(0), 0, 3, transfer},
    event_kind{9, any, bit(1), 1, 3, transfer},
    event_kind{9, any, bit(2), 2, 3, transfer},
    event_kind{9, any, bit(3), 3, 3, transfer},
    event_kind{9, any, bit(4), 4, 3, transfer},
    event_kind{9, any, bit(5), 5, 3, transfer},
    event_kind{9, any, bit(6), 6, 3, transfer},
    event_kind{9, any, bit(7), 7, 3, transfer},
    event_kind{9, any, bit(8), 8, 3, transfer},
    event_kind{9, any, bit(9), 9, 3, transfer},
    event_kind{9, any, bit(10), 10, 3, transfer},
    event_kind{9, any, bit(11), 11, 3, transfer},
    event_kind{9, any, bit(12), 12, 3, transfer},
    event_kind{9, any, bit(13), 13, 3, transfer},
    event_kind{9, any, bit(14), 14, 3, transfer},
    event_kind{9, any, bit(15), 15, 3, transfer},
    // wake
    event_kind{10, 0, bit(0), 0, 3, wake_statistics},
    event_kind{10, 0, bit(1), 1, 13, wake_request},
    event_kind{10, 0, bit(2), 2, 3, wake_event},
};

}  // namespace

const std::span<const event_kind> event_kinds = event_table;

}  // namespace platform::simulated
