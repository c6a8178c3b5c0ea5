// Reports with a regular layout, described as tables of rows that one renderer prints.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>

#include "nrxctl/base/source_place.h"
#include "platform/bytes.h"

namespace nrx {

// How a row's value is read and printed. All fields are little-endian.
enum class field_kind {
    heading,         // no value: the label alone is the line
    u32,             // unsigned 32-bit
    s32,             // signed 32-bit
    u64,             // unsigned 64-bit
    u32_above_bit0,  // bits 1 to 31 of an unsigned 32-bit field
    u32_minus,       // unsigned 32-bit field less another one; wraps around
    u64_minus,       // unsigned 64-bit field less another one; wraps around
    fixed16_single,  // signed 32-bit with 16 fraction bits, in single precision
    scan_periods,    // unsigned 32-bit count of periods of 2.56 seconds, in seconds
};

struct field_row {
    std::string_view label;
    field_kind kind = field_kind::heading;
    std::size_t offset = 0;
    std::string_view unit = {};  // follows the value
    std::size_t subtrahend = 0;  // offset of the other field of a difference
};

struct field_table {
    std::size_t length;          // of the whole record, in bytes
    std::size_t label_width;     // labels are padded with blanks to this width
    std::string_view separator;  // between the padded label and the value
    std::span<const field_row> rows;
};

// Prints a report row by row, a line each. Fields outside the report print as 0, and so does a
// difference of which one field is outside; a report shorter than the record is a failed check at
// place, the printer's own.
void print_fields(const field_table& table, platform::byte_view report,
                  source_place place = source_place::here());

}  // namespace nrx
