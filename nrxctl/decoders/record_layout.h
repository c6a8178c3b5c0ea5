// What the text of a record is made of: its rows, in the order in which they are written.
//
// Offsets count from the start of the record, as the coprocessor's profiler writes it.
#pragma once

#include <array>
#include <cstdint>

#include "nrxctl/decoders/field_key.h"
#include "nrxctl/decoders/record_row.h"

namespace nrx {

// A name in single quotes, and how wide it is at least.
struct name_field {
    consteval name_field(field_key name_key, std::uint8_t name_width)
        : key(name_key), width(name_width) {
        if (name_width > widest_padding) throw "the field is too wide";
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

// Behind the body.
inline constexpr std::array id_rows{
    rows::u8("type-id", 0, 0),
    rows::u8("category-id", 3, 0),
    rows::u8("component-id", 2, 0),
    rows::u8("event-id", 1, 0),
};
inline constexpr field_key binary_data_key{"binary-data"};
inline constexpr field_key calendar_time_key{"calendar-time"};
inline constexpr field_key boot_timestamp_key{"boot-timestamp"};

// Bodies, by the record's type.

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

// A type beyond the table has no body.
inline constexpr std::array body_by_type{
    record_rows(),                        // stop
    record_rows(long_data_rows),          //
    record_rows(short_data_rows),         //
    record_rows(event_rows),              //
    record_rows(trigger_rows),            //
    record_rows(function_rows),           //
    record_rows(),                        // kpdx-context1
    record_rows(),                        // kpdx-context2
    record_rows(sensor_info_rows),        //
    record_rows(external_function_rows),  //
    record_rows(),                        // kpdx-context
    record_rows(annotation_rows),         //
    record_rows(decimation_info_rows),    //
};

// Bodies of single records of two categories, which their decoders tell by the first word.

inline constexpr std::array talvor_data_in_rows{
    rows::u32("arg1", 16),      rows::u32("arg2", 20),      rows::u32("arg3", 24),
    rows::u32("arg4", 28),      rows::u32("arg5", 32),      rows::u32("arg6", 36),
    rows::fraction_16("x", 16), rows::fraction_16("y", 20), rows::fraction_16("z", 24),
};
inline constexpr std::array talvor_data_out_rows{
    rows::u32("arg1", 16),      rows::u32("arg2", 20),      rows::u32("arg3", 24),
    rows::u32("arg4", 28),      rows::u32("arg5", 32),      rows::u32("arg6", 36),
    rows::fraction_12("x", 16), rows::fraction_12("y", 20), rows::fraction_12("z", 24),
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

}  // namespace nrx
