#include "nrxctl/profiler/kernel_profiler.h"

#include <array>

#include "nrxctl/base/channel.h"
#include "nrxctl/base/check.h"
#include "nrxctl/base/services.h"
#include "platform/interrupt.h"

namespace nrx {

namespace {

constexpr std::uint32_t event_queue_memory = 0;
constexpr std::uint32_t event_notification = 0;

constexpr std::size_t log_capacity = 48'000;
constexpr int max_reads = 10;

platform::return_code call_driver(const profiler_conn& conn, std::uint32_t method,
                                  const platform::call_inputs& inputs = {}) {
    platform::call_outputs no_outputs;
    return platform::call(conn.connection(), method, inputs, no_outputs);
}

}  // namespace

bool profiler_conn::open(on_failure on_missing) {
    service_ = platform::first_match(match_name(name_));
    if (!service_ && on_missing == on_failure::ignore) return false;
    if (!check(service_, condition::service)) return false;
    return open_connection(service_, 0, connection_) == platform::success;
}

bool profiler_conn::open_queue(on_failure on_unmapped) {
    const bool success = open();
    if (!check(success, condition::success)) return false;
    platform::return_code kr = platform::map_memory(connection_, event_queue_memory, queue_);
    if (!queue_ && on_unmapped == on_failure::ignore) return false;
    if (!check_success(kr, condition::kr_is_zero)) return false;
    if (!check(queue_, "queue")) return false;
    port_ = platform::allocate_port();
    if (!check(port_, "rxPort")) return false;
    kr = platform::attach_port(connection_, event_notification, port_, 0);
    return check_success(kr, condition::kr_is_zero);
}

bool set_profiler_enabled(bool enable) {
    profiler_conn conn;
    const bool success = conn.open();
    if (!check(success, condition::success)) return false;
    const std::array<std::uint64_t, 1> scalars{enable ? 1U : 0U};
    const platform::return_code kr = call_driver(conn, profiler_method::set_enabled, {scalars, {}});
    return check_success(kr, condition::kr_is_zero);
}

bool get_profiler_status(bool& connected) {
    profiler_conn conn;
    const bool success = conn.open();
    if (!check(success, condition::success)) return false;
    std::array<std::uint64_t, 1> status{0};  // stays 0 if the driver returns no scalar
    platform::call_outputs outputs{status, {}};
    const platform::return_code kr =
        platform::call(conn.connection(), profiler_method::read_status, {}, outputs);
    if (!check_success(kr, condition::kr_is_zero)) return false;
    connected = status[0] != 0;
    return true;
}

std::optional<platform::return_code> send_kernel_configs(std::span<const profiler_config> configs) {
    profiler_conn conn;
    if (!conn.open()) return std::nullopt;
    const auto records = encode_configs(configs);
    return call_driver(conn, profiler_method::configure, {{}, records});
}

std::vector<profiler_config> read_kernel_configs(const profiler_conn& conn) {
    std::vector<std::uint8_t> buffer(max_active_configs * profiler_config::wire_size);
    platform::call_outputs outputs{{}, buffer};
    const platform::return_code kr =
        platform::call(conn.connection(), profiler_method::read_configs, {}, outputs);
    return kr == platform::success ? decode_configs(outputs.structure)
                                   : std::vector<profiler_config>();
}

void read_profiler_log(record_printer print, record_store store) {
    profiler_conn conn;
    if (!conn.open(on_failure::ignore)) return;
    std::vector<std::uint8_t> buffer(log_capacity);
    for (int read = 0; read < max_reads; ++read) {
        platform::call_outputs outputs{{}, buffer};
        const platform::return_code kr =
            platform::call(conn.connection(), static_cast<std::uint32_t>(store), {}, outputs);
        if (!check_success(kr, condition::kr_is_zero)) return;
        if (outputs.structure.size() < profile_record_size) return;
        print_complete_records(outputs.structure, print);
    }
}

void make_error_dump() {
    profiler_conn conn;
    if (!conn.open(on_failure::ignore)) return;
    const platform::return_code kr = call_driver(conn, profiler_method::make_error_dump);
    check_success(kr, condition::kr_is_zero);
}

void stop_on_interrupt() {
    profiler_conn conn;
    const bool success = conn.open();
    if (!check(success, condition::success)) return;
    const platform::return_code kr = call_driver(conn, profiler_method::stop_monitor);
    check_success(kr, condition::kr_is_zero);
}

scoped_interrupt_handler::scoped_interrupt_handler() {
    platform::set_interrupt_handler(stop_on_interrupt);
}

scoped_interrupt_handler::~scoped_interrupt_handler() {
    platform::restore_default_interrupt();
}

}  // namespace nrx
