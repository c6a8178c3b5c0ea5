#include "nrxctl/decoders/record_fields.h"

#include <algorithm>
#include <cstdint>

#include "nrxctl/base/field_text.h"
#include "nrxctl/base/fixed_point.h"
#include "nrxctl/base/little_endian.h"

namespace nrx {

namespace {

char* put_value(char* to, const profile_record& record, const record_row& row) {
    const std::uint8_t* source = record.bytes.data() + row.offset;
    switch (row.kind) {
        case row_kind::u8:
            return put_number(to, *source, row.width);
        case row_kind::u16:
            return put_number(to, load_le<std::uint16_t>(source), row.width);
        case row_kind::u32:
            return put_number(to, load_le<std::uint32_t>(source), row.width);
        case row_kind::u64:
            return put_number(to, load_le<std::uint64_t>(source), row.width);
        case row_kind::hex_u32:
            return put_quoted_hex(to, load_le<std::uint32_t>(source), row.width);
        case row_kind::fraction_16:
            return put_fraction(to, load_le<std::int32_t>(source) / fixed_point_one, row.width);
        case row_kind::fraction_12:
            return put_fraction(to, load_le<std::int32_t>(source) / fixed_point_one_12, row.width);
        case row_kind::constant:
            return put_number(to, row.extent, row.width);
        case row_kind::text:
            return put_quoted(to, text_before_nul({source, row.extent}), row.width);
        case row_kind::byte_list:
            return put_list(to, {source, row.extent}, row.width);
        case row_kind::counted_list: {
            const auto count = load_le<std::uint16_t>(record.bytes.data() + row.count_at);
            return put_list(to, {source, std::min<std::size_t>(count, row.extent)}, row.width);
        }
    }
    return to;
}

}  // namespace

void append_fields(event_text& line, const profile_record& record, const record_rows& fields) {
    line.append(fields.longest, [&](char* to) {
        for (const record_row& row : fields.all) {
            to = put_value(put(to, row.key.text), record, row);
            *to++ = ',';
        }
        return to;
    });
}

}  // namespace nrx
