#include "nrxctl/base/scalar_method.h"

#include "nrxctl/base/channel.h"
#include "nrxctl/base/failure_report.h"
#include "platform/connection.h"

namespace nrx {

platform::return_code call_scalar_method(std::string_view service_name,
                                         std::span<const std::uint64_t> scalars) {
    constexpr std::uint32_t scalar_selector = 0;
    channel to;
    const auto opened = open_channel(service_name, to);
    if (opened != platform::success) return opened;
    platform::call_outputs no_outputs;
    const auto kr = platform::call(to.connect, scalar_selector, {scalars, {}}, no_outputs);
    check_success(kr, "kr == 0 ");
    return kr;
}

}  // namespace nrx
