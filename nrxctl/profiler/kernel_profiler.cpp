#include "nrxctl/profiler/kernel_profiler.h"

#include <array>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/profile_records.h"

namespace nrx {

namespace {

constexpr std::size_t log_capacity = 48'000;
constexpr int most_reads = 10;

platform::return_code call_without_arguments(const profiler_conn& conn, std::uint32_t method) {
    platform::call_outputs nothing;
    return platform::call(conn.connection(), method, {}, nothing);
}

}  // namespace

bool set_profiler_enabled(bool enable) {
    profiler_conn conn;
    const bool success = conn.open();
    if (!check(success, "success")) return false;
    const std::array<std::uint64_t, 1> scalars{enable ? 1U : 0U};
    platform::call_outputs nothing;
    const platform::return_code kr =
        platform::call(conn.connection(), profiler_method::set_enabled, {scalars, {}}, nothing);
    return check_success(kr, "kr == 0 ");
}

bool get_profiler_status(bool& connected) {
    profiler_conn conn;
    const bool success = conn.open();
    if (!check(success, "success")) return false;
    std::array<std::uint64_t, 1> status{0};
    platform::call_outputs outputs{status, {}};
    const platform::return_code kr =
        platform::call(conn.connection(), profiler_method::read_status, {}, outputs);
    if (!check_success(kr, "kr == 0 ")) return false;
    connected = status[0] != 0;
    return true;
}

std::vector<profiler_config> read_kernel_configs(const profiler_conn& conn) {
    std::vector<std::uint8_t> buffer(most_active_configs * profiler_config::wire_size);
    platform::call_outputs outputs{{}, buffer};
    const platform::return_code kr =
        platform::call(conn.connection(), profiler_method::read_configs, {}, outputs);
    return kr == platform::success ? decode_configs(outputs.structure)
                                   : std::vector<profiler_config>();
}

void read_profiler_log(record_printer print, stored_records which) {
    profiler_conn conn;
    if (!conn.open(expected_failure::is_silent)) return;
    std::vector<std::uint8_t> buffer(log_capacity);
    for (int read = 0; read < most_reads; ++read) {
        platform::call_outputs outputs{{}, buffer};
        const platform::return_code kr =
            platform::call(conn.connection(), static_cast<std::uint32_t>(which), {}, outputs);
        if (!check_success(kr, "kr == 0 ")) return;
        if (outputs.structure.size() < profile_record_size) return;
        print_whole_records(outputs.structure, print);
    }
}

void make_error_dump() {
    profiler_conn conn;
    if (!conn.open(expected_failure::is_silent)) return;
    const platform::return_code kr = call_without_arguments(conn, profiler_method::make_error_dump);
    check_success(kr, "kr == 0 ");
}

void stop_on_interrupt() {
    profiler_conn conn;
    const bool success = conn.open();
    if (!check(success, "success")) return;
    const platform::return_code kr = call_without_arguments(conn, profiler_method::stop_monitor);
    check_success(kr, "kr == 0 ");
}

}  // namespace nrx
