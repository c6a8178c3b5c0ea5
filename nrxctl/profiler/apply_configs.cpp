#include "nrxctl/profiler/apply_configs.h"

#include <optional>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/profiler_conn.h"

namespace nrx {

namespace {

constexpr std::string_view kernel_refusal = "kext config: At least one config failed";

// The driver's answer; none if there is no connection to ask on.
std::optional<platform::return_code> send_to_kernel(std::span<const profiler_config> configs) {
    profiler_conn conn;
    if (!conn.open()) return std::nullopt;
    const auto records = encode_configs(configs);
    platform::call_outputs nothing;
    return platform::call(conn.connection(), profiler_method::configure, {{}, records}, nothing);
}

bool configure_kernel(std::span<const profiler_config> configs) {
    const auto result = send_to_kernel(configs);
    const bool success = result.has_value();
    if (!check(success, "success") || *result == platform::unsupported) {
        print_line(kernel_refusal);
        return true;
    }
    return check_success(*result, "result == 0 ");
}

}  // namespace

bool apply_profiler_configs(std::span<const profiler_config> configs) {
    const platform::return_code result = send_fw_configs(configs);
    if (result == platform::unsupported) {
        print_line("fw config: At least one config failed");
    } else if (!check_success(result, "result == 0 ")) {
        return false;
    }
    return configure_kernel(configs);
}

}  // namespace nrx
