#include "nrxctl/printers/spi_status.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::size_t type_offset = 8;
constexpr std::size_t header_size = 9;
constexpr std::size_t status_size = 17;
constexpr std::uint8_t status_type = 2;

struct captured_data {
    std::uint8_t type;
    std::string_view heading;
};

constexpr std::array captured_types{captured_data{0, "MOSI"}, captured_data{1, "MISO"},
                                    captured_data{3, "AccelVar"}};

struct error_text {
    std::uint32_t code;
    std::string_view before;  // the value of the record stands between the two
    number_base base;
    std::string_view after;
};

constexpr std::array error_texts{
    error_text{0x7001, "errorStatus(0x", number_base::hexadecimal, "), error: bad checksum"},
    error_text{0x7002, "errorStatus(0x", number_base::hexadecimal,
               "),  error: corrupted transport header"},
    error_text{0x7003, "errorStatus(0x", number_base::hexadecimal,
               "),  error:bad transport header status"},
    error_text{0x7004, "errorStatus(0x", number_base::hexadecimal, "),  error:spi read error"},
    error_text{0x7005, "", number_base::decimal, " packet_drops observed"},
};

text_line heading_of(const reply_fields& fields) {
    text_line line;
    return line.text("\ntimestamp: ").number(fields.u64(0)).text(", ");
}

void append_error(text_line& line, std::uint32_t code, std::uint32_t value) {
    for (const error_text& known : error_texts) {
        if (known.code != code) continue;
        line.text(known.before);
        if (known.base == number_base::hexadecimal) {
            line.hex(value);
        } else {
            line.number(static_cast<std::int32_t>(value));
        }
        line.text(known.after);
    }
}

void print_status(const reply_fields& fields) {
    const std::uint32_t code = fields.u32(9);
    text_line line = heading_of(fields);
    line.text("STATUS: errorCode(0x").hex(code).text("), ");
    append_error(line, code, fields.u32(13));
    print_line(line.view());
}

void print_captured(platform::byte_view record, std::uint8_t type) {
    for (const captured_data& known : captured_types) {
        if (known.type != type) continue;
        text_line line = heading_of(reply_fields(record));
        print_line(line.text(known.heading).text(": ").view());
        hex_dump(record.subspan(header_size));
    }
}

}  // namespace

void print_spi_status(platform::byte_view record) {
    if (record.empty()) return;
    const reply_fields fields(record);
    const std::uint8_t type = fields.u8(type_offset);
    const bool is_status = record.size() >= header_size && type == status_type;
    if (!check_length(record, is_status ? status_size : header_size)) return hex_dump(record);
    is_status ? print_status(fields) : print_captured(record, type);
}

}  // namespace nrx
