// The raw profile event record: its fields by offset, and how records are read.
//
// All integers are little-endian and unsigned:
//    0  u8   type           4  u32  sequence number
//    1  u8   event          8  u64  timestamp, in microseconds of the coprocessor's time
//    2  u8   component     16  32 bytes, whose layout depends on the type (for some categories, on
//    3  u8   category          the whole first word)
#pragma once

#include <array>
#include <concepts>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/little_endian.h"
#include "platform/bytes.h"

namespace nrx {

inline constexpr std::size_t profile_record_size = 48;

// The position of a run of bytes in a record. One that is not wholly inside does not compile.
struct record_extent {
    consteval record_extent(std::size_t start, std::size_t length)
        : offset(static_cast<std::uint8_t>(start)), size(static_cast<std::uint8_t>(length)) {
        if (start > profile_record_size || length > profile_record_size - start)
            throw "outside a record";
    }

    std::uint8_t offset;
    std::uint8_t size;
};

// The position of a number in a record. One that is not wholly inside does not compile.
template <std::integral Number>
struct record_offset {
    consteval record_offset(std::size_t offset)
        : value(record_extent(offset, sizeof(Number)).offset) {}

    std::uint8_t value;
};

// One 48-byte event of the coprocessor's profiler, as the driver delivers it. Records follow one
// another without gaps.
struct profile_record {
    [[nodiscard]] std::uint8_t u8(record_offset<std::uint8_t> offset) const { return load(offset); }
    [[nodiscard]] std::uint16_t u16(record_offset<std::uint16_t> offset) const {
        return load(offset);
    }
    [[nodiscard]] std::uint32_t u32(record_offset<std::uint32_t> offset) const {
        return load(offset);
    }
    [[nodiscard]] std::uint64_t u64(record_offset<std::uint64_t> offset) const {
        return load(offset);
    }
    [[nodiscard]] platform::byte_view bytes_at(record_extent extent) const {
        return platform::byte_view(bytes).subspan(extent.offset, extent.size);
    }

    [[nodiscard]] std::uint32_t first_word() const { return u32(0); }
    [[nodiscard]] std::uint8_t type() const { return u8(0); }
    [[nodiscard]] std::uint8_t event() const { return u8(1); }
    [[nodiscard]] std::uint8_t component() const { return u8(2); }
    [[nodiscard]] std::uint8_t category() const { return u8(3); }
    [[nodiscard]] std::uint32_t sequence_num() const { return u32(4); }
    [[nodiscard]] std::uint64_t timestamp() const { return u64(8); }

    std::array<std::uint8_t, profile_record_size> bytes;

private:
    template <class Number>
    [[nodiscard]] Number load(record_offset<Number> offset) const {
        return load_le<Number>(bytes.data() + offset.value);
    }
};
static_assert(sizeof(profile_record) == profile_record_size);

// Prints one record.
using record_printer = void (*)(const profile_record& record);

// Passes each complete record in a buffer to print, in order. Trailing bytes are ignored.
void print_complete_records(platform::byte_view records, record_printer print);

// Drains the profiler's own log, report 0xd1 of the service "profile", and passes each record to
// print: up to ten reads, until one returns nothing or fails. A failure is reported twice, by the
// read and here.
void read_profile_records(record_printer print);

}  // namespace nrx
