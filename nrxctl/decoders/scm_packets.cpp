#include "nrxctl/decoders/scm_packets.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_text.h"

namespace nrx {

namespace {

constexpr std::uint8_t long_data_type = 1;
constexpr std::uint8_t event_type = 3;
constexpr std::uint8_t scm_category = 9;

constexpr id_name_table buses(scm_components);

// By the first word of the body.
constexpr std::array direction_rows{name_row{0, "scm_read"}, name_row{1, "scm_write"}};
constexpr name_table directions(direction_rows);

constexpr record_extent data_extent{24, 24};

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
    if (!may_print_event()) return;
    text_line label;
    label.text(label_).text(":   data[").number(offset).text("-").number(length - 1);
    label.text("/").number(packet_size).text("]: ");
    const auto data = record.bytes_at(data_extent);
    nrx_profile_hexdump(label.view(), data.first(std::min<std::size_t>(length, data.size())), 1);
}

void scm_packet_printer::print_transfer(const profile_record& record) {
    const short_text* bus = buses.find(record.component());
    const std::string_view* direction = directions.find(record.u32(16));
    if (bus == nullptr || direction == nullptr) return;
    if (!may_print_event()) return;
    last_transfer_ = record.timestamp();
    label_.assign(bus->view()).append(".");
    label_.append(std::to_string(record.event()));
    const auto bus_time = static_cast<std::int64_t>(record.u64(20));
    text_line line;
    line.text(label_).text(": ").text(*direction).text(" wqr_timestamp=");
    line.number(static_cast<std::int64_t>(last_transfer_)).text(" scm_timestamp=").number(bus_time);
    print_line(line.view());
}

void print_scm_packet(const profile_record& record) {
    static scm_packet_printer printer;
    printer.print(record);
}

}  // namespace nrx
