#include "nrxctl/inspection/sensor_details.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "nrxctl/base/check.h"
#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/identifiers.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

namespace {

// Extra information

constexpr std::string_view info_label = "ExtraInfo   : ";
constexpr std::array<report_id, 4> info_block_reports{0x39, 0x3a, 0x3b, 0x3c};
constexpr std::size_t info_block_capacity = 1024;

// Prints one block. Collects a line item by item and prints it when it ends.
class block_printer {
public:
    block_printer(platform::byte_view block, number_base& base) : block_(block), base_(base) {
        line_.text(info_label);
    }

    void print() {
        while (offset_ < block_.size() && print_item(block_[offset_++])) {
        }
        print_line(line_.view());
    }

private:
    // Handles the item with that tag. Returns true if the block continues after it.
    bool print_item(std::uint8_t tag) {
        switch (tag) {
            case 0:
                return append_number<std::int32_t>();
            case 1:
                return append_number<std::int64_t>();
            case 2:
                append_text();
                return true;
            case 3:
                print_line(line_.view());
                line_.clear();
                line_.text(info_label);
                return true;
            case 4:
                base_ = number_base::hexadecimal;
                return true;
            case 5:
                base_ = number_base::decimal;
                return true;
            default:
                print_as_malformed();
                return false;
        }
    }

    template <class Number>
    bool append_number() {
        if (!check_length(block_, offset_ + sizeof(Number))) return false;
        const auto number = load_le<Number>(block_.data() + offset_);
        offset_ += sizeof(Number);
        if (base_ == number_base::decimal) {
            line_.number(number);
        } else {
            line_.hex(static_cast<std::make_unsigned_t<Number>>(number));
        }
        return true;
    }

    void append_text() {
        const std::string_view text = text_before_nul(block_.subspan(offset_));
        line_.text(text);
        offset_ += text.size() + 1;
    }

    void print_as_malformed() {
        print_line(line_.view());
        line_.clear();
        print_line("data error");
        hex_dump(block_);
    }

    platform::byte_view block_;
    number_base& base_;
    std::size_t offset_ = 0;
    text_line line_;
};

// Registers: a count, then an entry for each register, which has its address and its value, u16
// each.

constexpr sensor_report register_report{0x38, 1024, 0, reply_length::variable};
constexpr std::size_t register_list_header_size = 4;
constexpr std::size_t register_size = 4;
constexpr std::size_t register_value_offset = 2;
constexpr std::size_t min_register_digits = 2;

void append_registers(text_line& line, const sensor_reply& list) {
    const std::uint64_t count = list.number<std::uint32_t>();
    if (!check(list.bytes().size() >= register_list_header_size + count * register_size,
               "size >= sizeof(NrxRegisterList) + list->count*sizeof(list->regs[0])")) {
        return;
    }
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t offset = register_list_header_size + i * register_size;
        const auto address = list.number<std::uint16_t>(offset);
        const auto value = list.number<std::uint16_t>(offset + register_value_offset);
        line.text("R").zero_padded_hex(address, min_register_digits);
        line.text("=").zero_padded_hex(value, min_register_digits).text(" ");
    }
}

// Performance counters: a count, then an entry for each counter, which has a name, an s32 and
// twelve bytes that are not printed.

constexpr sensor_report perf_mode_report{0x26, 4};
constexpr sensor_report perf_counter_report{0x31, 256, 0, reply_length::variable};
constexpr std::int32_t automatic_mode = 2;
constexpr std::size_t perf_header_size = 4;
constexpr std::size_t perf_counter_size = 24;
constexpr std::size_t perf_name_size = 8;

void print_counters(platform::byte_view reply) {
    text_line line;
    line.text("APPerfmon   : ");
    check_length(reply, perf_header_size);
    std::size_t count = reply_fields(reply).u32(0);
    platform::byte_view counters = reply.subspan(std::min(reply.size(), perf_header_size));
    for (; count > 0 && counters.size() >= perf_counter_size; --count) {
        line.text(text_before_nul(counters.first(perf_name_size))).text(": ");
        line.number(reply_fields(counters).s32(perf_name_size)).text(" ");
        counters = counters.subspan(perf_counter_size);
    }
    print_line(line.view());
}

}  // namespace

void print_extra_info(std::string_view service_name) {
    number_base base = number_base::decimal;
    for (const report_id id : info_block_reports) {
        const sensor_report report{id, info_block_capacity, 0, reply_length::variable};
        print_info_block(read_sensor_report(service_name, report).bytes(), base);
    }
}

void print_info_block(platform::byte_view block, number_base& base) {
    block_printer(block, base).print();
}

void print_register_list(std::string_view service_name) {
    const sensor_reply list = read_sensor_report(service_name, register_report);
    text_line line;
    line.text("SensorRegs  : ");
    if (list.was_read()) {
        append_registers(line, list);
    } else {
        line.text("<not supperted>");
    }
    print_line(line.view());
}

void print_perf_counters(std::string_view service_name) {
    const sensor_reply mode = read_sensor_report(service_name, perf_mode_report);
    if (!mode.was_read()) return print_line("APPerfmon   : perfmon is not supported");
    if (mode.s32() != automatic_mode)
        return print_line("APPerfmon   : perfmon is not in auto mode");
    const sensor_reply counters = read_sensor_report(service_name, perf_counter_report);
    const platform::return_code kr = counters.result();
    if (check_success(kr, condition::kr_is_zero)) print_counters(counters.bytes());
}

}  // namespace nrx
