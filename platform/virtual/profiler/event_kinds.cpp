// What each component of the profiler reports, and what stands in it. Layouts by type:
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

void put_text(byte_span record, std::size_t offset, std::string_view text) {
    std::copy(text.begin(), text.end(), record.begin() + static_cast<std::ptrdiff_t>(offset));
}

void put_words(byte_span record, const std::array<std::uint64_t, 6>& words) {
    for (std::size_t i = 0; i < words.size(); ++i) {
        put_le(record, 16 + 4 * i, 4, words[i]);
    }
}

// A small number that moves with the turn but stays within a range.
constexpr std::uint64_t within(std::uint64_t turn, std::uint64_t least, std::uint64_t range) {
    return least + turn * 37 % range;
}

constexpr std::uint64_t thread_address(std::uint64_t turn) {
    return 0x2000'4000 + 0x180 * (turn % 6);
}

void long_data(byte_span record, std::uint64_t turn) {
    constexpr std::size_t most_bytes = 24;
    const std::uint64_t length = within(turn, 4, most_bytes - 3);
    put_le(record, 16, 2, turn % 5);
    put_le(record, 18, 2, length);
    put_le(record, 20, 2, length);
    for (std::size_t i = 0; i < length; ++i) {
        put_le(record, 24 + i, 1, turn * 3 + i);
    }
}

void short_data(byte_span record, std::uint64_t turn) {
    put_le(record, 16, 2, turn % 7);
    for (std::size_t i = 18; i < record.size(); ++i) {
        put_le(record, i, 1, turn + 5 * i);
    }
}

void arguments(byte_span record, std::uint64_t turn) {
    put_words(record, {turn, thread_address(turn), thread_address(turn + 1), within(turn, 3, 900),
                       turn % 4, within(turn, 20, 64)});
}

void trigger(byte_span record, std::uint64_t turn) {
    put_le(record, 20, 4, thread_address(turn));
}

void function(byte_span record, std::uint64_t turn) {
    put_words(record, {0x0800'1000 + 0x24 * (turn % 40), turn % 3, thread_address(turn),
                       within(turn, 5, 400), turn % 8, within(turn, 400, 9000)});
}

void context(byte_span record, std::uint64_t turn) {
    put_words(record, {0x0800'1000 + 4 * turn, thread_address(turn), turn % 16, turn, 0, 0});
}

void sensor_info(byte_span record, std::uint64_t turn) {
    put_words(record, {10'000, 200'000, within(turn, 1, 64), 1'000'000, 0, 0});
    put_le(record, 32, 1, 1);
    put_le(record, 33, 1, 1 + turn % 4);
    put_le(record, 34, 1, turn % 3);
    put_text(record, 35, "client");
    put_le(record, 41, 1, '0' + turn % 10);
}

void extended_function(byte_span record, std::uint64_t turn) {
    put_words(record, {1 + turn % 5, thread_address(turn), within(turn, 8, 700), turn, 0, 0});
    static constexpr std::array<std::string_view, 3> names{"dispatch_report", "pump_queue",
                                                           "step_filter"};
    put_text(record, 32, names[turn % names.size()]);
}

void annotation(byte_span record, std::uint64_t turn) {
    put_le(record, 16, 8, 0x1'0000'0000 + turn);
    put_text(record, 24, "step");
    put_le(record, 28, 1, 'a' + turn % 26);
    put_le(record, 32, 4, within(turn, 1, 100));
    put_le(record, 36, 4, turn % 2);
}

void decimation(byte_span record, std::uint64_t turn) {
    put_le(record, 16, 8, 2'500 * turn);
    put_le(record, 24, 4, 1'250);
    put_le(record, 28, 4, 10'000);
    put_le(record, 32, 4, 200'000);
    put_text(record, 36, "motion");
}

// Samples of the three axes in fixed point: gravity on z, a little movement on x and y.
void samples(byte_span record, std::uint64_t turn, std::uint64_t one) {
    const std::uint64_t x = turn % 64 * one / 256;
    put_words(record, {x, 0 - x / 2, one - one / 128, turn, within(turn, 100, 50), 3});
}

void samples_in(byte_span record, std::uint64_t turn) {
    samples(record, turn, 65'536);
}

void samples_out(byte_span record, std::uint64_t turn) {
    samples(record, turn, 4'096);
}

// The direction and the bus controller's own time.
void transfer(byte_span record, std::uint64_t turn) {
    put_le(record, 16, 4, turn % 2);
    put_le(record, 20, 8, 24'000 * turn + 17);
}

void wake_statistics(byte_span record, std::uint64_t turn) {
    put_words(record, {turn % 27, turn / 27 + 1, within(turn, 50, 400), 0, 0, 0});
}

void wake_request(byte_span record, std::uint64_t turn) {
    put_le(record, 16, 4, turn % 27);
    put_le(record, 20, 8, 0xffff'fff0'0000'0000 + 0x40 * (turn % 12));
}

void wake_event(byte_span record, std::uint64_t turn) {
    put_le(record, 16, 4, turn % 27);
    put_le(record, 20, 4, 0x10 + turn % 8);
}

constexpr std::uint32_t any = event_kind::any_component;
constexpr std::uint32_t always = 0xffffffff;

constexpr std::uint32_t bit(unsigned n) {
    return std::uint32_t{1} << n;
}

// Category, component, report bits; event, type, body.
constexpr std::array event_table{
    // exec: scheduler, function, workloop, command, extfunction, timing
    event_kind{0, 0, always, 0, 3, arguments},
    event_kind{0, 0, always, 1, 3, arguments},
    event_kind{0, 0, always, 2, 3, arguments},
    event_kind{0, 1, always, 0, 5, function},
    event_kind{0, 2, always, 0, 3, arguments},
    event_kind{0, 2, always, 1, 3, arguments},
    event_kind{0, 3, bit(0), 0, 3, arguments},
    event_kind{0, 3, bit(1), 1, 3, arguments},
    event_kind{0, 3, bit(2), 2, 1, long_data},
    event_kind{0, 3, bit(3), 3, 2, short_data},
    event_kind{0, 3, bit(4), 4, 3, arguments},
    event_kind{0, 3, bit(5), 5, 1, long_data},
    event_kind{0, 3, bit(6), 6, 1, long_data},
    event_kind{0, 3, bit(7), 7, 2, short_data},
    event_kind{0, 4, always, 0, 9, extended_function},
    event_kind{0, 5, always, 0, 10, context},
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
