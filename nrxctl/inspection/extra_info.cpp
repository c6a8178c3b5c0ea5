#include "nrxctl/inspection/extra_info.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "nrxctl/base/field_text.h"
#include "nrxctl/base/hex_dump.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

namespace {

constexpr std::string_view label = "ExtraInfo   : ";
constexpr std::array<std::uint32_t, 4> block_reports{0x39, 0x3a, 0x3b, 0x3c};
constexpr std::size_t block_capacity = 1024;

// Prints one block item by item; the line under way is written at its end.
class block_printer {
public:
    block_printer(platform::byte_view block, number_base& base) : block_(block), base_(base) {
        line_.text(label);
    }

    void print() {
        while (at_ < block_.size() && print_item(block_[at_++])) {
        }
        print_line(line_.view());
    }

private:
    // Whether the block goes on behind the item.
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
                line_.text(label);
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
        if (!check_length(block_, at_ + sizeof(Number))) return false;
        const auto number = load_le<Number>(block_.data() + at_);
        at_ += sizeof(Number);
        if (base_ == number_base::decimal) {
            line_.number(number);
        } else {
            line_.hex(static_cast<std::make_unsigned_t<Number>>(number));
        }
        return true;
    }

    void append_text() {
        const std::string_view text = text_before_nul(block_.subspan(at_));
        line_.text(text);
        at_ += text.size() + 1;
    }

    void print_as_malformed() {
        print_line(line_.view());
        line_.clear();
        print_line("data error");
        hex_dump(block_);
    }

    platform::byte_view block_;
    number_base& base_;
    std::size_t at_ = 0;
    text_line line_;
};

}  // namespace

void print_extra_info(std::string_view service_name) {
    number_base base = number_base::decimal;
    for (const std::uint32_t id : block_reports) {
        const sensor_report report{id, block_capacity, 0, reply_extent::variable};
        print_info_block(read_sensor_report(service_name, report).bytes(), base);
    }
}

void print_info_block(platform::byte_view block, number_base& base) {
    block_printer(block, base).print();
}

}  // namespace nrx
