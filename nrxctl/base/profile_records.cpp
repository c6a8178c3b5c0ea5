#include "nrxctl/base/profile_records.h"

#include <algorithm>
#include <cstdint>
#include <vector>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/whole_records.h"

namespace nrx {

namespace {

constexpr std::uint32_t profile_log_report = 0xd1;
constexpr std::size_t log_capacity = 65536;
constexpr int most_reads = 10;

}  // namespace

void print_whole_records(platform::byte_view records, record_printer print) {
    for_each_record(records, profile_record_size, [&](platform::byte_view bytes) {
        profile_record record;
        std::copy(bytes.begin(), bytes.end(), record.bytes.begin());
        print(record);
    });
}

void read_profile_records(record_printer print) {
    std::vector<std::uint8_t> buffer(log_capacity);
    for (int read = 0; read < most_reads; ++read) {
        platform::byte_span records = buffer;
        const auto result = get_report("profile", profile_log_report, records);
        if (!check_success(result, "result == 0 ")) return;
        if (records.empty()) return;
        print_whole_records(records, print);
    }
}

}  // namespace nrx
