#include "nrxctl/printers/field_table.h"

#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr double seconds_per_scan_period = 2.56;

// Returns 0 unless the report holds both fields, because a difference needs both.
template <class Number>
Number difference(const reply_fields& fields, const field_row& row) {
    if (!fields.contains<Number>(row.offset) || !fields.contains<Number>(row.subtrahend)) return 0;
    return fields.number<Number>(row.offset) - fields.number<Number>(row.subtrahend);
}

void append_value(text_line& line, const field_row& row, const reply_fields& fields) {
    switch (row.kind) {
        case field_kind::heading:
            break;
        case field_kind::u32:
            line.number(fields.u32(row.offset));
            break;
        case field_kind::s32:
            line.number(fields.s32(row.offset));
            break;
        case field_kind::u64:
            line.number(fields.u64(row.offset));
            break;
        case field_kind::u32_high_31_bits:
            line.number(fields.u32(row.offset) >> 1);
            break;
        case field_kind::u32_minus:
            line.number(difference<std::uint32_t>(fields, row));
            break;
        case field_kind::u64_minus:
            line.number(difference<std::uint64_t>(fields, row));
            break;
        case field_kind::q16_16:
            line.general(static_cast<float>(fields.s32(row.offset)) /
                         static_cast<float>(q16_16_one));
            break;
        case field_kind::scan_periods:
            line.general(fields.u32(row.offset) * seconds_per_scan_period);
            break;
    }
}

}  // namespace

void print_fields(const field_table& table, platform::byte_view report, source_location location) {
    check_length(report, table.length, location);
    const reply_fields fields(report);
    text_line line;
    for (const field_row& row : table.rows) {
        line.clear();
        if (row.kind == field_kind::heading) {
            line.text(row.label);
        } else {
            line.pad_right(row.label, table.label_width).text(table.separator);
            append_value(line, row, fields);
            line.text(row.unit);
        }
        print_line(line.view());
    }
}

}  // namespace nrx
