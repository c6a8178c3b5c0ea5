#include "nrxctl/base/mca.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <span>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"

namespace nrx {

namespace {

constexpr const char* service_name = "mca";

constexpr std::uint32_t power_command = 0x20;
constexpr std::uint32_t mode_command = 0x22;
constexpr std::uint32_t interval_report = 0x16;
constexpr std::uint32_t buffer_report = 0xd8;

constexpr std::size_t mode_payload_size = 69;

struct step_payload {
    std::array<std::uint8_t, mode_payload_size> bytes{};
    std::size_t size = 0;
};

constexpr step_payload one_byte(std::uint8_t byte) {
    return {{byte}, 1};
}

// Little-endian 32-bit words.
constexpr step_payload words(std::initializer_list<std::uint32_t> values) {
    step_payload payload;
    for (const std::uint32_t value : values) {
        store_le(payload.bytes.data() + payload.size, value);
        payload.size += sizeof(value);
    }
    return payload;
}

// The mode of a setting: the setting, a byte that is always 1, the mode, and zeros.
constexpr step_payload mode_of(std::uint32_t setting, std::uint32_t mode) {
    step_payload payload;
    store_le(payload.bytes.data(), setting);
    payload.bytes[4] = 1;
    store_le(payload.bytes.data() + 5, mode);
    payload.size = mode_payload_size;
    return payload;
}

enum class step_kind { command, report };

struct step {
    step_kind kind;
    std::uint32_t id;
    step_payload payload;
};

constexpr std::array steps_on{
    step{step_kind::command, power_command, one_byte(1)},
    step{step_kind::command, mode_command, mode_of(16, 3)},
    step{step_kind::command, mode_command, mode_of(60, 1)},
    step{step_kind::command, mode_command, mode_of(128, 3)},
    step{step_kind::report, buffer_report, words({0, 0, 0, 128, 0, 8192})},
    step{step_kind::report, interval_report, words({10'000})},
};

constexpr std::array steps_off{
    step{step_kind::report, interval_report, words({0})},
    step{step_kind::command, mode_command, mode_of(16, 0)},
    step{step_kind::command, mode_command, mode_of(60, 0)},
    step{step_kind::command, mode_command, mode_of(128, 0)},
    step{step_kind::command, power_command, one_byte(0)},
};

platform::return_code carry_out(const step& one) {
    const platform::byte_view payload(one.payload.bytes.data(), one.payload.size);
    if (one.kind == step_kind::report) return set_report(service_name, one.id, payload);
    platform::byte_span no_response;
    return send_command(service_name, one.id, payload, no_response);
}

}  // namespace

platform::return_code switch_mca(bool on) {
    print_line(on ? "Turning ON MCA" : "Turning OFF MCA");
    const std::span<const step> steps = on ? std::span<const step>(steps_on) : steps_off;
    for (const step& one : steps) {
        const platform::return_code kr = carry_out(one);
        if (!check_success(kr, "kr == 0 ")) return kr;
    }
    return platform::success;
}

}  // namespace nrx
