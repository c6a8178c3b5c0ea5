#include "nrxctl/base/profile_record.h"

#include <algorithm>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/reply_fields.h"

namespace nrx {

namespace {

constexpr report_id profile_log_report = 0xd1;
constexpr std::size_t log_capacity = 65536;
constexpr int max_reads = 10;

}  // namespace

void print_complete_records(platform::byte_view records, record_printer print) {
    for_each_record(records, profile_record_size, [&](platform::byte_view bytes) {
        profile_record record;
        std::copy(bytes.begin(), bytes.end(), record.bytes.begin());
        print(record);
    });
}

void read_profile_records(record_printer print) {
    std::vector<std::uint8_t> buffer(log_capacity);
    for (int read = 0; read < max_reads; ++read) {
        platform::byte_span records = buffer;
        const auto result = get_report("profile", profile_log_report, records);
        if (!check_success(result, condition::result_is_zero)) return;
        if (records.empty()) return;
        print_complete_records(records, print);
    }
}

}  // namespace nrx
