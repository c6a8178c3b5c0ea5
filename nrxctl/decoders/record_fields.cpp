#include "nrxctl/decoders/record_fields.h"

#include <algorithm>
#include <cstdint>

#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/decoders/write_text.h"

namespace nrx {

namespace {

char* write_value(char* target, const profile_record& record, const record_row& row) {
    const std::uint8_t* source = record.bytes.data() + row.offset;
    switch (row.kind) {
        case row_kind::u8:
            return write_number(target, *source, row.width);
        case row_kind::u16:
            return write_number(target, load_le<std::uint16_t>(source), row.width);
        case row_kind::u32:
            return write_number(target, load_le<std::uint32_t>(source), row.width);
        case row_kind::u64:
            return write_number(target, load_le<std::uint64_t>(source), row.width);
        case row_kind::hex_u32:
            return write_quoted_hex(target, load_le<std::uint32_t>(source), row.width);
        case row_kind::q16_16:
            return write_fraction(target, load_le<std::int32_t>(source) / q16_16_one, row.width);
        case row_kind::q20_12:
            return write_fraction(target, load_le<std::int32_t>(source) / q20_12_one, row.width);
        case row_kind::constant:
            return write_number(target, row.extent, row.width);
        case row_kind::text:
            return write_quoted(target, text_before_nul({source, row.extent}), row.width);
        case row_kind::byte_list:
            return write_list(target, {source, row.extent}, row.width);
        case row_kind::counted_list: {
            const auto count = load_le<std::uint16_t>(record.bytes.data() + row.count_offset);
            return write_list(target, {source, std::min<std::size_t>(count, row.extent)},
                              row.width);
        }
    }
    return target;
}

}  // namespace

void append_fields(event_text& line, const profile_record& record, const record_rows& fields) {
    line.append(fields.max_text, [&](char* target) {
        for (const record_row& row : fields.rows) {
            target = write_value(write_text(target, row.key.text), record, row);
            *target++ = ',';
        }
        return target;
    });
}

}  // namespace nrx
