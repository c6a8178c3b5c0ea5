// The fields of a record's text, as rows, and how they are written.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/event_text.h"
#include "nrxctl/decoders/short_text.h"
#include "nrxctl/decoders/write_text.h"

namespace nrx {

// A key as it is written: a space, the key in single quotes, a colon. A key that is too long does
// not compile.
struct field_key {
    consteval field_key(const char* key) {
        text.append(" '").append(key).append("':");
        if (!text.view().ends_with("':")) throw "the key is too long";
    }

    short_text text;
};

enum class row_kind : std::uint8_t {
    u8,            // unsigned, in decimal
    u16,           // the same
    u32,           // the same
    u64,           // the same
    hex_u32,       // unsigned, in hexadecimal and single quotes
    q16_16,        // signed 32 bits, of which 16 are the fraction
    q20_12,        // signed 32 bits, of which 12 are the fraction
    constant,      // a number that is the same for every record
    text,          // characters before the first zero byte, in single quotes
    byte_list,     // bytes as a list of numbers
    counted_list,  // the same, but at most as many as a u16 of the record says
};

// A field: its key, the kind and position of its value, and the minimum width of the value, which
// is padded with spaces on the left. Made by the functions in namespace rows, which accept only
// positions inside the record.
struct record_row {
    field_key key;
    row_kind kind;
    std::uint8_t width;
    std::uint8_t offset;            // of the value
    std::uint8_t extent = 0;        // maximum number of bytes; the value of a constant
    std::uint8_t count_offset = 0;  // of the count of a counted list
};

inline constexpr std::uint8_t number_width = 10;

// The maximum number of digits of an unsigned number.
inline constexpr std::size_t max_u8_digits = 3;
inline constexpr std::size_t max_u16_digits = 5;
inline constexpr std::size_t max_u32_digits = 10;
inline constexpr std::size_t max_u32_hex_digits = 8;
inline constexpr std::size_t max_u64_digits = 20;

// The longest fraction with six significant digits, and a pair of quotes.
inline constexpr std::size_t max_fraction_text = std::string_view("-1.52588e-05").size();
inline constexpr std::size_t quotes = 2;

// The maximum number of characters of a row's value, without its padding.
consteval std::size_t max_value_text(const record_row& row) {
    switch (row.kind) {
        case row_kind::u8:
        case row_kind::constant:
            return max_u8_digits;
        case row_kind::u16:
            return max_u16_digits;
        case row_kind::u32:
            return max_u32_digits;
        case row_kind::u64:
            return max_u64_digits;
        case row_kind::hex_u32:  // the width covers only the opening quote
            return row.width + max_u32_hex_digits + 1;
        case row_kind::q16_16:
        case row_kind::q20_12:
            return max_fraction_text;
        case row_kind::text:
            return row.extent + quotes;
        case row_kind::byte_list:
        case row_kind::counted_list:
            return max_list_size(row.extent);
    }
    throw "a kind without a bound";
}

// The maximum number of characters of a row: key, value, comma.
consteval std::size_t max_row_text(const record_row& row) {
    if (row.width > max_padding) throw "the field is too wide";
    return row.key.text.size() + std::max<std::size_t>(row.width, max_value_text(row)) + 1;
}

// A table of rows, and the maximum number of characters that they take.
struct record_rows {
    consteval record_rows() = default;
    template <std::size_t Count>
    consteval record_rows(const std::array<record_row, Count>& table) : rows(table) {
        for (const record_row& row : table)
            max_text += max_row_text(row);
    }

    std::span<const record_row> rows;
    std::size_t max_text = 0;
};

// Appends each row: its key, its value, a comma.
void append_fields(event_text& line, const profile_record& record, const record_rows& fields);

namespace rows {

consteval record_row u8(field_key key, record_offset<std::uint8_t> offset,
                        std::uint8_t width = number_width) {
    return {key, row_kind::u8, width, offset.value};
}
consteval record_row u16(field_key key, record_offset<std::uint16_t> offset) {
    return {key, row_kind::u16, number_width, offset.value};
}
consteval record_row u32(field_key key, record_offset<std::uint32_t> offset) {
    return {key, row_kind::u32, number_width, offset.value};
}
consteval record_row u64(field_key key, record_offset<std::uint64_t> offset) {
    return {key, row_kind::u64, number_width, offset.value};
}
consteval record_row hex_u32(field_key key, record_offset<std::uint32_t> offset) {
    return {key, row_kind::hex_u32, number_width, offset.value};
}
consteval record_row q16_16(field_key key, record_offset<std::int32_t> offset) {
    return {key, row_kind::q16_16, number_width, offset.value};
}
consteval record_row q20_12(field_key key, record_offset<std::int32_t> offset) {
    return {key, row_kind::q20_12, number_width, offset.value};
}
consteval record_row constant(field_key key, std::uint8_t value, std::uint8_t width) {
    return {key, row_kind::constant, width, 0, value};
}
consteval record_row text(field_key key, record_extent extent, std::uint8_t width) {
    return {key, row_kind::text, width, extent.offset, extent.size};
}
consteval record_row byte_list(field_key key, record_extent extent, std::uint8_t width) {
    return {key, row_kind::byte_list, width, extent.offset, extent.size};
}
consteval record_row counted_list(field_key key, record_extent extent,
                                  record_offset<std::uint16_t> count) {
    return {key, row_kind::counted_list, number_width, extent.offset, extent.size, count.value};
}

}  // namespace rows

}  // namespace nrx
