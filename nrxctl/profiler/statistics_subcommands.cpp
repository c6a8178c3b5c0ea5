#include <array>
#include <cstdint>
#include <vector>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/statistics_tables.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

void clear_event_source_statistics(argument_words& /*words*/) {
    const platform::return_code kr = clear_event_sources();
    check_success(kr, "kr == 0 ");
}

void show_event_sources(argument_words& /*words*/) {
    std::vector<std::uint8_t> buffer(event_sources_capacity);
    platform::byte_span rows = buffer;
    const platform::return_code kr = read_event_sources(rows);
    if (check_success(kr, "kr == 0 ")) print_event_sources(rows);
}

void show_wake_requests(argument_words& /*words*/) {
    std::array<std::uint8_t, wake_requests_capacity> buffer{};
    platform::byte_span counts = buffer;
    const platform::return_code kr = read_wake_requests(counts);
    if (check_success(kr, "kr == 0 ")) print_wake_requests(counts);
}

}  // namespace nrx::profile
