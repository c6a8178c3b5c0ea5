// How long the text of a record can be, computed from the tables that it is written from.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <span>

#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

// A name has no more than the digits of its identifier, or is in one of the tables.
consteval std::size_t longest_name(name_field field, std::span<const name_table> tables) {
    std::size_t longest = u8_digits;
    for (const name_table& table : tables) {
        for (const id_name& entry : table)
            longest = std::max(longest, entry.name.size());
    }
    return field.key.text.size() + std::max<std::size_t>(field.width, longest + quotes) + 1;
}

// "{ " and the four names.
inline constexpr std::size_t longest_names = [] {
    constexpr std::array categories{name_table(category_names)};
    constexpr std::array types{name_table(type_names)};
    return 2 + longest_name(category_field, categories) +
           longest_name(component_field, component_tables) +
           longest_name(event_field, event_tables) + longest_name(type_field, types);
}();

inline constexpr std::size_t longest_body = [] {
    std::size_t longest = 0;
    for (const record_rows& body : body_by_type)
        longest = std::max(longest, body.longest);
    for (const record_rows& body : special_bodies)
        longest = std::max(longest, body.longest);
    return longest;
}();

// The bytes, both times and "}".
inline constexpr std::size_t longest_end =
    binary_data_key.text.size() + longest_list(profile_record_size) + 1 +
    calendar_time_key.text.size() + quotes + short_text::capacity + 1 +
    boot_timestamp_key.text.size() + u64_digits + 1;

// The most characters of a record's text.
inline constexpr std::size_t longest_record_text = longest_names +
                                                   record_rows(header_rows).longest + longest_body +
                                                   record_rows(id_rows).longest + longest_end;

}  // namespace nrx
