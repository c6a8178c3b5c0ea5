#include "nrxctl/printers/haptic_assets.h"

#include <cstddef>

#include "nrxctl/base/fixed_point.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/printers/haptic_names.h"

namespace nrx {

namespace {

// Speed-major; one event more than there are names for.
constexpr std::int32_t speeds = 3;
constexpr std::int32_t events = 17;
constexpr std::size_t entry_size = 29;
constexpr std::size_t table_size = speeds * events * entry_size;

// Offsets inside an entry; the last four bytes are not printed.
constexpr std::size_t enable_offset = 0;  // u8, non-zero is enabled
constexpr std::size_t gain_offset = 1;    // s32 with 16 fraction bits
constexpr std::size_t min_offset = 5;     // u64
constexpr std::size_t max_offset = 13;    // u64
constexpr std::size_t slot_offset = 21;   // s32

void print_asset(const reply_fields& fields, std::int32_t speed, std::int32_t event) {
    const std::size_t entry = static_cast<std::size_t>(speed * events + event) * entry_size;
    text_line line;
    line.text("ASSET [").text(name_of(speed_names, speed)).text("][");
    line.text(name_of(button_event_names, event)).text("]: enable ");
    line.number(fields.u8(entry + enable_offset) != 0 ? 1 : 0);
    line.text(", slot ").number(fields.s32(entry + slot_offset));
    line.text(", gain ").general(fields.s32(entry + gain_offset) / fixed_point_one);
    line.text(", min ").number(fields.u64(entry + min_offset));
    line.text(", max ").number(fields.u64(entry + max_offset));
    print_line(line.view());
}

}  // namespace

void print_haptic_assets(std::string_view /*service_name*/, std::int32_t /*report_id*/,
                         platform::byte_view report) {
    if (report.empty()) return;
    text_line line;
    line.text("Length: ").number(report.size()).text(", expected ").number(table_size);
    print_line(line.view());
    const reply_fields fields(report);
    for (std::int32_t speed = 0; speed < speeds; ++speed) {
        for (std::int32_t event = 0; event < events; ++event)
            print_asset(fields, speed, event);
    }
}

}  // namespace nrx
