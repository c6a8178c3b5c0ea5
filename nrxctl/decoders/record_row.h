// One field of a record's text, as data.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/field_key.h"

namespace nrx {

enum class row_kind : std::uint8_t {
    u8,            // unsigned numbers in decimal
    u16,           //
    u32,           //
    u64,           //
    hex_u32,       // the same in hexadecimal, in single quotes
    fraction_16,   // signed 32 bits, 16 of them the fraction
    fraction_12,   // signed 32 bits, 12 of them the fraction
    constant,      // a number that is the same for every record
    text,          // characters up to the first zero byte, in single quotes
    byte_list,     // bytes as a list of numbers
    counted_list,  // the same, but only as many as a u16 of the record says
};

// A field: its key, what its value is made of, and how wide the value is at least (it is padded
// with blanks on the left). The makers below see to it that all lies inside the record.
struct record_row {
    field_key key;
    row_kind kind;
    std::uint8_t width;
    std::uint8_t offset;        // where the value stands
    std::uint8_t extent = 0;    // how many bytes it has at most; for a constant, its value
    std::uint8_t count_at = 0;  // where the count of a counted list stands
};

using record_rows = std::span<const record_row>;

inline constexpr std::uint8_t number_width = 10;

namespace rows {

consteval record_row u8(field_key key, record_offset<std::uint8_t> at,
                        std::uint8_t width = number_width) {
    return {key, row_kind::u8, width, at.value};
}
consteval record_row u16(field_key key, record_offset<std::uint16_t> at) {
    return {key, row_kind::u16, number_width, at.value};
}
consteval record_row u32(field_key key, record_offset<std::uint32_t> at) {
    return {key, row_kind::u32, number_width, at.value};
}
consteval record_row u64(field_key key, record_offset<std::uint64_t> at) {
    return {key, row_kind::u64, number_width, at.value};
}
consteval record_row hex_u32(field_key key, record_offset<std::uint32_t> at) {
    return {key, row_kind::hex_u32, number_width, at.value};
}
consteval record_row fraction_16(field_key key, record_offset<std::int32_t> at) {
    return {key, row_kind::fraction_16, number_width, at.value};
}
consteval record_row fraction_12(field_key key, record_offset<std::int32_t> at) {
    return {key, row_kind::fraction_12, number_width, at.value};
}
consteval record_row constant(field_key key, std::uint8_t value, std::uint8_t width) {
    return {key, row_kind::constant, width, 0, value};
}
consteval record_row text(field_key key, record_extent place, std::uint8_t width) {
    return {key, row_kind::text, width, place.offset, place.size};
}
consteval record_row byte_list(field_key key, record_extent place, std::uint8_t width) {
    return {key, row_kind::byte_list, width, place.offset, place.size};
}
consteval record_row counted_list(field_key key, record_extent place,
                                  record_offset<std::uint16_t> count_at) {
    return {key, row_kind::counted_list, number_width, place.offset, place.size, count_at.value};
}

}  // namespace rows

}  // namespace nrx
