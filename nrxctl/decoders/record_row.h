// One field of a record's text, as data.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/field_key.h"
#include "nrxctl/decoders/put_text.h"

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

inline constexpr std::uint8_t number_width = 10;

// The most digits of unsigned numbers; the longest fraction with six significant digits.
inline constexpr std::size_t u8_digits = 3;
inline constexpr std::size_t u16_digits = 5;
inline constexpr std::size_t u32_digits = 10;
inline constexpr std::size_t u32_hex_digits = 8;
inline constexpr std::size_t u64_digits = 20;
inline constexpr std::size_t longest_fraction = std::string_view("-1.52588e-05").size();
inline constexpr std::size_t quotes = 2;

// The most characters of a row's value, blanks in front of it aside.
consteval std::size_t longest_value(const record_row& row) {
    switch (row.kind) {
        case row_kind::u8:
        case row_kind::constant:
            return u8_digits;
        case row_kind::u16:
            return u16_digits;
        case row_kind::u32:
            return u32_digits;
        case row_kind::u64:
            return u64_digits;
        case row_kind::hex_u32:  // the width covers the opening quote alone
            return row.width + u32_hex_digits + 1;
        case row_kind::fraction_16:
        case row_kind::fraction_12:
            return longest_fraction;
        case row_kind::text:
            return row.extent + quotes;
        case row_kind::byte_list:
        case row_kind::counted_list:
            return longest_list(row.extent);
    }
    throw "a kind without a bound";
}

// The most characters of a row: key, value, comma.
consteval std::size_t longest_row(const record_row& row) {
    if (row.width > widest_padding) throw "the field is too wide";
    return row.key.text.size() + std::max<std::size_t>(row.width, longest_value(row)) + 1;
}

// A table of rows, and the most characters that they are written in.
struct record_rows {
    consteval record_rows() = default;
    template <std::size_t Count>
    consteval record_rows(const std::array<record_row, Count>& table) : all(table) {
        for (const record_row& row : all)
            longest += longest_row(row);
    }

    std::span<const record_row> all;
    std::size_t longest = 0;
};

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
