// The parts of a record's text, in the order in which they are written, and its maximum length.
//
// Offsets count from the start of the record.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <span>

#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_fields.h"

namespace nrx {

// A name in single quotes, and its minimum width.
struct name_field {
    consteval name_field(field_key name_key, std::uint8_t name_width)
        : key(name_key), width(name_width) {
        if (name_width > max_padding) throw "the field is too wide";
    }

    field_key key;
    std::uint8_t width;
};

// Before the body.
inline constexpr name_field category_field{"category", 8};
inline constexpr name_field component_field{"component", 8};
inline constexpr name_field event_field{"event", 12};
inline constexpr name_field type_field{"type", 12};
inline constexpr std::array header_rows{
    rows::u64("timestamp", 8),
    rows::u32("sequence_num", 4),
};

// After the body.
inline constexpr std::array id_rows{
    rows::u8("type-id", 0, 0),
    rows::u8("category-id", 3, 0),
    rows::u8("component-id", 2, 0),
    rows::u8("event-id", 1, 0),
};
inline constexpr field_key binary_data_key{"binary-data"};
inline constexpr field_key calendar_time_key{"calendar-time"};
inline constexpr field_key boot_timestamp_key{"boot-timestamp"};

// Bodies of the types.

inline constexpr std::array long_data_rows{
    rows::u16("subtype", 16),
    rows::u16("packet-size", 18),
    rows::u16("data-length", 20),
    rows::u16("data-offset", 22),
    rows::counted_list("raw-data", {24, 24}, 20),
};
inline constexpr std::array short_data_rows{
    rows::u16("subtype", 16),
    rows::constant("packet-size", 30, number_width),
    rows::constant("data-length", 30, number_width),
    rows::constant("data-offset", 0, number_width),
    rows::byte_list("raw-data", {18, 30}, number_width),
};
inline constexpr std::array event_rows{
    rows::u32("arg1", 16),      rows::u32("arg2", 20),      rows::u32("arg3", 24),
    rows::u32("arg4", 28),      rows::u32("arg5", 32),      rows::u32("arg6", 36),
    rows::hex_u32("xarg1", 16), rows::hex_u32("xarg2", 20), rows::hex_u32("xarg3", 24),
    rows::hex_u32("xarg4", 28), rows::hex_u32("xarg5", 32), rows::hex_u32("xarg6", 36),
};
inline constexpr std::array trigger_rows{
    rows::constant("trigger", 1, 0),
    rows::u32("thread-id", 20),
    rows::u32("arg", 20),
};
inline constexpr std::array function_rows{
    rows::u32("function-id", 16), rows::u32("extra-id", 20), rows::u32("thread-id", 24),
    rows::u32("duration", 28),    rows::u32("depth", 32),    rows::u32("thread_duration", 36),
};
inline constexpr std::array sensor_info_rows{
    rows::text("name", {35, 12}, 16), rows::u32("report-interval", 16),
    rows::u32("batch-interval", 20),  rows::u32("threshold", 24),
    rows::u32("time-limit", 28),      rows::u8("connected", 32),
    rows::u8("decimation", 33),       rows::u8("gyroPowerMode", 34),
};
inline constexpr std::array external_function_rows{
    rows::text("function", {32, 16}, 10),
    rows::u32("arg", 28),
    rows::u32("task", 16),
    rows::u32("thread", 20),
    rows::u32("duration", 24),
};
inline constexpr std::array annotation_rows{
    rows::u64("global-id", 16), rows::u64("entry-id", 24), rows::text("entry", {24, 8}, 10),
    rows::u32("arg1", 32),      rows::u32("arg2", 36),
};
inline constexpr std::array decimation_info_rows{
    rows::text("name", {36, 12}, 16), rows::u32("sample-interval", 24),
    rows::u32("report-interval", 28), rows::u32("batch-interval", 32),
    rows::u64("next-dispatch", 16),
};

// By type. A type beyond the table has no body.
inline constexpr std::array body_by_type{
    record_rows(),                        // stop
    record_rows(long_data_rows),          // long-data
    record_rows(short_data_rows),         // short-data
    record_rows(event_rows),              // event
    record_rows(trigger_rows),            // trigger
    record_rows(function_rows),           // function
    record_rows(),                        // kpdx-context1
    record_rows(),                        // kpdx-context2
    record_rows(sensor_info_rows),        // sensorinfo
    record_rows(external_function_rows),  // extfunction
    record_rows(),                        // kpdx-context
    record_rows(annotation_rows),         // annotation
    record_rows(decimation_info_rows),    // decimationinfo
};

// Bodies of records that a category decoder selects by the first word (category_decoders.cpp).

inline constexpr std::array talvor_data_in_rows{
    rows::u32("arg1", 16), rows::u32("arg2", 20), rows::u32("arg3", 24),
    rows::u32("arg4", 28), rows::u32("arg5", 32), rows::u32("arg6", 36),
    rows::q16_16("x", 16), rows::q16_16("y", 20), rows::q16_16("z", 24),
};
inline constexpr std::array talvor_data_out_rows{
    rows::u32("arg1", 16), rows::u32("arg2", 20), rows::u32("arg3", 24),
    rows::u32("arg4", 28), rows::u32("arg5", 32), rows::u32("arg6", 36),
    rows::q20_12("x", 16), rows::q20_12("y", 20), rows::q20_12("z", 24),
};
inline constexpr std::array wake_request_rows{
    rows::u32("wake_reason", 16),
    rows::u64("endpoint_ref", 20),
};
inline constexpr std::array wake_event_rows{
    rows::u32("wake_reason", 16),
    rows::u32("service_id", 20),
};
inline constexpr std::array special_bodies{
    record_rows(talvor_data_in_rows),
    record_rows(talvor_data_out_rows),
    record_rows(wake_request_rows),
    record_rows(wake_event_rows),
};

// Bounds, in characters.

// A name is in one of the tables or has the digits of its identifier.
consteval std::size_t max_name_text(name_field field, std::span<const id_name_table> tables) {
    std::size_t max_name = max_u8_digits;
    for (const id_name_table& table : tables) {
        for (const id_name& row : table.rows())
            max_name = std::max(max_name, row.name.size());
    }
    return field.key.text.size() + std::max<std::size_t>(field.width, max_name + quotes) + 1;
}

// "{ " and the four names.
inline constexpr std::size_t max_names_text = [] {
    constexpr std::array categories{id_name_table(category_names)};
    constexpr std::array types{id_name_table(type_names)};
    return 2 + max_name_text(category_field, categories) +
           max_name_text(component_field, component_tables) +
           max_name_text(event_field, event_tables) + max_name_text(type_field, types);
}();

inline constexpr std::size_t max_body_text = [] {
    std::size_t max_text = 0;
    for (const record_rows& body : body_by_type)
        max_text = std::max(max_text, body.max_text);
    for (const record_rows& body : special_bodies)
        max_text = std::max(max_text, body.max_text);
    return max_text;
}();

// The bytes, both times and "}".
inline constexpr std::size_t max_end_text =
    binary_data_key.text.size() + max_list_size(profile_record_size) + 1 +
    calendar_time_key.text.size() + quotes + short_text::capacity + 1 +
    boot_timestamp_key.text.size() + max_u64_digits + 1;

inline constexpr std::size_t max_record_text = max_names_text + record_rows(header_rows).max_text +
                                               max_body_text + record_rows(id_rows).max_text +
                                               max_end_text;

}  // namespace nrx
