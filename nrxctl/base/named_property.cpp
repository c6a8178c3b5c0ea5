#include "nrxctl/base/named_property.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <memory>
#include <new>
#include <vector>

#include "nrxctl/base/channel.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "platform/connection.h"

namespace nrx {

namespace {

// Method selectors of an interface service.
constexpr std::uint32_t set_property_selector = 4;
constexpr std::uint32_t get_property_selector = 5;

}  // namespace

platform::return_code set_named_property(std::string_view service_name,
                                         std::string_view property_name,
                                         platform::byte_view value) {
    channel to;
    const auto opened = open_channel(service_name, to);
    if (opened != platform::success) return opened;
    // The name with its NUL, then the value.
    const std::size_t name_size = property_name.size() + 1;
    const std::size_t size = name_size + value.size();
    const std::unique_ptr<std::uint8_t[]> buffer(new (std::nothrow) std::uint8_t[size]);
    if (!check(buffer, "buffer")) return platform::no_memory;
    auto* end = std::copy(property_name.begin(), property_name.end(), buffer.get());
    *end++ = 0;
    std::copy(value.begin(), value.end(), end);
    const std::array<std::uint64_t, 1> scalars{name_size};
    platform::call_outputs no_outputs;
    const auto kr = platform::call(to.connect, set_property_selector,
                                   {scalars, {buffer.get(), size}}, no_outputs);
    check_success(kr, "kr == 0 ");
    return kr;
}

platform::return_code get_named_property(std::string_view service_name,
                                         std::string_view property_name,
                                         platform::byte_span& value) {
    channel from;
    const auto opened = open_channel(service_name, from);
    if (opened != platform::success) return opened;
    std::vector<std::uint8_t> name(property_name.begin(), property_name.end());
    name.push_back(0);
    platform::call_outputs outputs{{}, value};
    const auto kr = platform::call(from.connect, get_property_selector, {{}, name}, outputs);
    if (kr == platform::success) value = outputs.structure;
    if (kr == platform::unsupported) print_line("\nget named property not supported");
    check_success(kr, "kr == 0 ");
    return kr;
}

}  // namespace nrx
