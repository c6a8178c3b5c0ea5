#include "nrxctl/printers/transfer_errors.h"

#include <cstddef>

#include "nrxctl/base/field_text.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/whole_records.h"

namespace nrx {

namespace {

constexpr std::size_t record_size = 32;
constexpr std::size_t name_offset = 24;
constexpr std::size_t longest_name = 7;
constexpr std::size_t name_width = 15;

void print_record(platform::byte_view record) {
    const reply_fields fields(record);
    text_line line;
    line.left(text_before_nul(record.subspan(name_offset, longest_name)), name_width);
    line.text(" read_errors: ").number(fields.s32(4)).text("/").number(fields.s32(0));
    line.text(" write_errors: ").number(fields.s32(12)).text("/").number(fields.s32(8));
    line.text(" other_errors: ").number(fields.s32(20)).text("/").number(fields.s32(16));
    print_line(line.view());
}

}  // namespace

void print_transfer_errors(std::string_view /*service_name*/, std::int32_t /*report_id*/,
                           platform::byte_view report) {
    for_each_record(report, record_size, print_record);
}

}  // namespace nrx
