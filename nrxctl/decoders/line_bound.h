// How long the text of a record can be, computed from the tables that it is written from.
#pragma once

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <span>
#include <string_view>

#include "nrxctl/decoders/calendar_time.h"
#include "nrxctl/decoders/name_tables.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

// The most digits of unsigned numbers; the longest fraction with six significant digits.
inline constexpr std::size_t u8_digits = 3;
inline constexpr std::size_t u16_digits = 5;
inline constexpr std::size_t u32_digits = 10;
inline constexpr std::size_t u32_hex_digits = 8;
inline constexpr std::size_t u64_digits = 20;
inline constexpr std::size_t longest_fraction = std::string_view("-1.52588e-05").size();
inline constexpr std::size_t quotes = 2;
inline constexpr std::size_t comma = 1;

// Brackets, the bytes, a comma behind each but the last.
constexpr std::size_t longest_list(std::size_t bytes) {
    return 2 + bytes * (u8_digits + 1);
}

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

consteval std::size_t longest_rows(record_rows fields) {
    std::size_t sum = 0;
    for (const record_row& row : fields) {
        sum += row.key.size + std::max<std::size_t>(row.width, longest_value(row)) + comma;
    }
    return sum;
}

consteval std::size_t longest_name(name_field field, std::span<const name_table> tables) {
    std::size_t longest = u8_digits;
    for (const name_table& table : tables) {
        for (const id_name& entry : table)
            longest = std::max(longest, entry.name.size());
    }
    return field.key.size + std::max<std::size_t>(field.width, longest + quotes) + comma;
}

// A body is written from one of these tables; the wake request has a type that has no rows.
consteval std::size_t longest_body() {
    std::size_t longest = 0;
    for (const record_rows body : body_by_type)
        longest = std::max(longest, longest_rows(body));
    for (const record_rows body :
         {record_rows(talvor_data_in_rows), record_rows(talvor_data_out_rows),
          record_rows(wake_request_rows), record_rows(wake_event_rows)}) {
        longest = std::max(longest, longest_rows(body));
    }
    return longest;
}

consteval std::size_t longest_head() {
    constexpr std::array categories{name_table(category_names)};
    constexpr std::array types{name_table(type_names)};
    return std::string_view("{ ").size() + longest_name(category_field, categories) +
           longest_name(component_field, component_tables) +
           longest_name(event_field, event_tables) + longest_name(type_field, types) +
           longest_rows(header_rows);
}

consteval std::size_t longest_tail() {
    return longest_rows(id_rows) + binary_data_key.size + longest_list(profile_record_size) +
           comma + calendar_time_key.size + quotes + longest_calendar_time + comma +
           boot_timestamp_key.size + u64_digits + std::string_view("}").size();
}

// The most characters of a record's text.
inline constexpr std::size_t longest_record_text = longest_head() + longest_body() + longest_tail();

}  // namespace nrx
