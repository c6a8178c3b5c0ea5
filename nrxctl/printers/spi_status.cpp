#include "nrxctl/printers/spi_status.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/name_table.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::size_t type_offset = 8;
constexpr std::size_t header_size = 9;
constexpr std::size_t status_size = 17;
constexpr std::uint8_t status_type = 2;

// Captured data, by record type.
constexpr std::array heading_rows{name_row{0, "MOSI"}, name_row{1, "MISO"},
                                  name_row{3, "AccelVar"}};
constexpr name_table headings(heading_rows);

struct error_row {
    std::uint32_t code;
    std::string_view before_value;
    number_base base;
    std::string_view after_value;
};

constexpr std::array errors{
    error_row{0x7001, "errorStatus(0x", number_base::hexadecimal, "), error: bad checksum"},
    error_row{0x7002, "errorStatus(0x", number_base::hexadecimal,
              "),  error: corrupted transport header"},
    error_row{0x7003, "errorStatus(0x", number_base::hexadecimal,
              "),  error:bad transport header status"},
    error_row{0x7004, "errorStatus(0x", number_base::hexadecimal, "),  error:spi read error"},
    error_row{0x7005, "", number_base::decimal, " packet_drops observed"},
};

text_line begin_line(const reply_fields& fields) {
    text_line line;
    return line.text("\ntimestamp: ").number(fields.u64(0)).text(", ");
}

void append_error(text_line& line, std::uint32_t code, std::uint32_t value) {
    const auto* error = std::find_if(errors.begin(), errors.end(),
                                     [&](const error_row& row) { return row.code == code; });
    if (error == errors.end()) return;
    line.text(error->before_value);
    if (error->base == number_base::hexadecimal) {
        line.hex(value);
    } else {
        line.number(static_cast<std::int32_t>(value));
    }
    line.text(error->after_value);
}

void print_status(const reply_fields& fields) {
    const std::uint32_t code = fields.u32(9);
    text_line line = begin_line(fields);
    line.text("STATUS: errorCode(0x").hex(code).text("), ");
    append_error(line, code, fields.u32(13));
    print_line(line.view());
}

void print_captured(platform::byte_view record, std::string_view heading) {
    text_line line = begin_line(reply_fields(record));
    print_line(line.text(heading).text(": ").view());
    hex_dump(record.subspan(header_size));
}

}  // namespace

void print_spi_status(platform::byte_view record) {
    if (record.empty()) return;
    const reply_fields fields(record);
    const std::uint8_t type = fields.u8(type_offset);
    const bool is_complete_header = record.size() >= header_size;
    const bool is_status = is_complete_header && type == status_type;
    const std::string_view* heading = headings.find(type);
    if (is_complete_header && !is_status && heading == nullptr) return;
    if (!may_print_event()) return;
    if (!check_length(record, is_status ? status_size : header_size)) return hex_dump(record);
    is_status ? print_status(fields) : print_captured(record, *heading);
}

}  // namespace nrx
