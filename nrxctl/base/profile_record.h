// The raw profile event record, and its fields by offset.
//
// All integers are little-endian and unsigned:
//    0  u8   type           4  u32  sequence number
//    1  u8   event          8  u64  time stamp, in microseconds of the coprocessor's time
//    2  u8   component     16  32 bytes, whose layout the type (for some categories, the whole
//    3  u8   category          first word) tells
#pragma once

#include <array>
#include <concepts>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/little_endian.h"
#include "platform/bytes.h"

namespace nrx {

inline constexpr std::size_t profile_record_size = 48;

// Where a run of bytes stands in a record. One that is not wholly inside does not compile.
struct record_extent {
    consteval record_extent(std::size_t at, std::size_t length)
        : offset(static_cast<std::uint8_t>(at)), size(static_cast<std::uint8_t>(length)) {
        if (at > profile_record_size || length > profile_record_size - at) throw "outside a record";
    }

    std::uint8_t offset;
    std::uint8_t size;
};

// Where a number stands in a record. One that is not wholly inside does not compile.
template <std::integral Number>
struct record_offset {
    consteval record_offset(std::size_t at) : value(record_extent(at, sizeof(Number)).offset) {}

    std::uint8_t value;
};

// One 48-byte event of the coprocessor's profiler, as the driver hands it over. Records follow one
// another back to back; a trailing part that is shorter is no record.
struct profile_record {
    [[nodiscard]] std::uint8_t u8(record_offset<std::uint8_t> at) const { return load(at); }
    [[nodiscard]] std::uint16_t u16(record_offset<std::uint16_t> at) const { return load(at); }
    [[nodiscard]] std::uint32_t u32(record_offset<std::uint32_t> at) const { return load(at); }
    [[nodiscard]] std::uint64_t u64(record_offset<std::uint64_t> at) const { return load(at); }
    [[nodiscard]] platform::byte_view run(record_extent place) const {
        return platform::byte_view(bytes).subspan(place.offset, place.size);
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
    [[nodiscard]] Number load(record_offset<Number> at) const {
        return load_le<Number>(bytes.data() + at.value);
    }
};
static_assert(sizeof(profile_record) == profile_record_size);

// Prints one record.
using record_printer = void (*)(const profile_record& record);

}  // namespace nrx
