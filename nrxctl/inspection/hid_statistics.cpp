#include "nrxctl/inspection/hid_statistics.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/fixed_point.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/whole_records.h"
#include "nrxctl/inspection/event_stream.h"
#include "nrxctl/inspection/stats_key_names.h"

namespace nrx {

namespace {

constexpr std::size_t record_size = 7;

enum class value_kind { none, integer, fraction };

struct operation_row {
    std::string_view label;
    value_kind value;
};

// By the operation's number; every number beyond is as the last one.
constexpr std::array operation_rows{
    operation_row{": NOP", value_kind::none},       operation_row{": clear ", value_kind::none},
    operation_row{": set ", value_kind::integer},   operation_row{": add ", value_kind::integer},
    operation_row{": clear ", value_kind::none},    operation_row{": set ", value_kind::fraction},
    operation_row{": push ", value_kind::fraction},
};

void print_record(platform::byte_view bytes) {
    const reply_fields record(bytes);
    const auto& row =
        operation_rows[std::min<std::size_t>(record.u8(1), operation_rows.size() - 1)];
    const std::int32_t value = record.s32(3);
    std::ostream& out = event_stream();
    out << "TALY_CALLBACK" << row.label;
    print_stats_key_name(out, record.u8(2));
    if (row.value == value_kind::integer) out << " " << value;
    if (row.value == value_kind::fraction) out << " " << value / fixed_point_one;
    end_event_line();
}

}  // namespace

void stats_callback(platform::byte_view records) {
    for_each_record(records, record_size, print_record);
}

}  // namespace nrx
