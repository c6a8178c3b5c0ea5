// Reports with a regular layout: a table of rows, each of which prints as a line.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>

#include "nrxctl/base/failure_report.h"
#include "platform/bytes.h"

namespace nrx {

// How a row's value is read and printed. All fields are little-endian.
enum class field_kind {
    heading,           // no value: the line is the label
    u32,               // unsigned 32-bit
    s32,               // signed 32-bit
    u64,               // unsigned 64-bit
    u32_high_31_bits,  // bits 1 to 31 of an unsigned 32-bit field
    u32_minus,         // unsigned 32-bit field minus another one; wraps around
    u64_minus,         // unsigned 64-bit field minus another one; wraps around
    q16_16,            // signed 32-bit with 16 fraction bits, in single precision
    scan_periods,      // unsigned 32-bit count of periods of 2.56 seconds, in seconds
};

struct field_row {
    std::string_view label;
    field_kind kind = field_kind::heading;
    std::size_t offset = 0;
    std::string_view unit = {};  // after the value
    std::size_t subtrahend = 0;  // offset of the other field of a difference
};

struct field_table {
    std::size_t length;          // of a complete report, in bytes
    std::size_t label_width;     // labels are padded with spaces to this width
    std::string_view separator;  // between the padded label and the value
    std::span<const field_row> rows;
};

// Prints a report, a line for each row. Fields outside the report print as 0, and so does a
// difference if one of its fields is outside. A report shorter than the table's length is a failed
// check at location, which is the caller's.
void print_fields(const field_table& table, platform::byte_view report,
                  source_location location = source_location::current());

}  // namespace nrx
