// The service "mca": its power, its modes by setting, and the two reports that it is given.

#include <algorithm>
#include <array>
#include <string>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

constexpr std::uint32_t power_command = 0x20;
constexpr std::uint32_t mode_command = 0x22;
constexpr std::size_t mode_payload_size = 69;
constexpr std::array<std::uint32_t, 3> settings{16, 60, 128};
constexpr std::uint32_t highest_mode = 3;

constexpr std::uint32_t interval_report = 0x16;
constexpr std::uint32_t buffer_report = 0xd8;

// The property that tells the mode of a setting.
std::string mode_property(std::uint32_t setting) {
    return "mode-" + std::to_string(setting);
}

return_code switch_power(interface_driver& mca, byte_view payload) {
    if (payload.size() != 1 || payload[0] > 1) return bad_argument;
    mca.set_named_property("power", {payload[0]});
    return success;
}

// Setting, the number 1, mode; what follows is kept free.
return_code set_mode(interface_driver& mca, byte_view payload) {
    if (payload.size() != mode_payload_size || payload[4] != 1) return bad_argument;
    const std::uint32_t setting = get_u32(payload, 0);
    const std::uint32_t mode = get_u32(payload, 5);
    const auto rest = payload.subspan(9);
    const bool known = std::find(settings.begin(), settings.end(), setting) != settings.end();
    const bool is_free = std::all_of(rest.begin(), rest.end(), [](auto byte) { return byte == 0; });
    if (!known || mode > highest_mode || !is_free) return bad_argument;
    mca.set_named_property(mode_property(setting), byte_list(&payload[5], &payload[9]));
    return success;
}

// A report that only takes bytes of its own size.
void put_sized_report(interface_driver& service, std::uint32_t id, std::size_t size) {
    service.set_report(id, byte_list(size));
    service.set_report_sink(
        id, [size](byte_view report) { return report.size() == size ? success : bad_argument; });
}

}  // namespace

void add_mca(machine& device) {
    interface_driver& mca = interface_of(device, "mca");
    mca.set_named_property("power", {0});
    for (const std::uint32_t setting : settings) {
        mca.set_named_property(mode_property(setting), byte_list(4));
    }
    mca.set_command(power_command, [&mca](byte_view payload, byte_list& /*reply*/) {
        return switch_power(mca, payload);
    });
    mca.set_command(mode_command, [&mca](byte_view payload, byte_list& /*reply*/) {
        return set_mode(mca, payload);
    });
    put_sized_report(mca, interval_report, 4);
    put_sized_report(mca, buffer_report, 24);
}

}  // namespace platform::simulated
