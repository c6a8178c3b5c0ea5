#include "nrxctl/decoders/scm_packets.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/decoders/profile_hexdump.h"

namespace nrx {

namespace {

constexpr std::uint8_t long_data_type = 1;
constexpr std::uint8_t event_type = 3;
constexpr std::uint8_t scm_category = 9;

// By component.
constexpr std::array<std::string_view, 6> bus_names{"spi0",  "smb0",      "smb1",
                                                    "i2cm0", "i2c_ctrl0", "i2c_ctrl1"};
// By the first word of the body.
constexpr std::array<std::string_view, 2> direction_names{"scm_read", "scm_write"};

constexpr record_extent data_place{24, 24};

}  // namespace

void scm_packet_printer::print(const profile_record& record) {
    if (record.type() == long_data_type) {
        print_data(record);
    } else if (record.type() == event_type && record.category() == scm_category) {
        print_transfer(record);
    }
}

void scm_packet_printer::print_data(const profile_record& record) const {
    const std::uint16_t packet_size = record.u16(18);
    const std::uint16_t length = record.u16(20);
    const std::uint16_t offset = record.u16(22);
    if (length == 0 || record.timestamp() != last_transfer_) return;
    text_line label;
    label.text(label_).text(":   data[").number(offset).text("-").number(length - 1);
    label.text("/").number(packet_size).text("]: ");
    const auto data = record.run(data_place);
    nrx_profile_hexdump(label.view(), data.first(std::min<std::size_t>(length, data.size())), 1);
}

void scm_packet_printer::print_transfer(const profile_record& record) {
    const std::uint32_t direction = record.u32(16);
    if (record.component() >= bus_names.size() || direction >= direction_names.size()) return;
    last_transfer_ = record.timestamp();
    label_.assign(bus_names[record.component()]).append(".");
    label_.append(std::to_string(record.event()));
    const auto bus_time = static_cast<std::int64_t>(record.u64(20));
    text_line line;
    line.text(label_).text(": ").text(direction_names[direction]).text(" wqr_timestamp=");
    line.number(static_cast<std::int64_t>(last_transfer_)).text(" scm_timestamp=").number(bus_time);
    print_line(line.view());
}

void print_scm_packet(const profile_record& record) {
    static scm_packet_printer printer;
    printer.print(record);
}

}  // namespace nrx
