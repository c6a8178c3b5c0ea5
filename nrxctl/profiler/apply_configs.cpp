#include "nrxctl/profiler/apply_configs.h"

#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"

namespace nrx {

namespace {

bool configure_fw(std::span<const profiler_config> configs) {
    const platform::return_code result = send_fw_configs(configs);
    if (result == platform::unsupported) {
        print_line("fw config: At least one config failed");
        return true;
    }
    return check_success(result, condition::result_is_zero);
}

bool configure_kernel(std::span<const profiler_config> configs) {
    const auto result = send_kernel_configs(configs);
    const bool success = result.has_value();
    if (!check(success, condition::success) || *result == platform::unsupported) {
        print_line("kext config: At least one config failed");
        return true;
    }
    return check_success(*result, condition::result_is_zero);
}

}  // namespace

bool apply_profiler_configs(std::span<const profiler_config> configs) {
    return configure_fw(configs) && configure_kernel(configs);
}

}  // namespace nrx
