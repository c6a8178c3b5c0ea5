#include "nrxctl/base/mca.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <span>

#include "nrxctl/base/check.h"
#include "nrxctl/base/command_channel.h"
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

constexpr step_payload byte_payload(std::uint8_t byte) {
    return {{byte}, 1};
}

// Little-endian 32-bit numbers.
constexpr step_payload words_payload(std::initializer_list<std::uint32_t> values) {
    step_payload payload;
    for (const std::uint32_t value : values) {
        store_le(payload.bytes.data() + payload.size, value);
        payload.size += sizeof(value);
    }
    return payload;
}

// Sets the mode of a setting: the setting, a byte that is always 1, the mode, and zeros.
constexpr step_payload mode_payload(std::uint32_t setting, std::uint32_t mode) {
    step_payload payload;
    store_le(payload.bytes.data(), setting);
    payload.bytes[4] = 1;
    store_le(payload.bytes.data() + 5, mode);
    payload.size = mode_payload_size;
    return payload;
}

enum class step_kind { command, report };

struct mca_step {
    step_kind kind;
    std::uint32_t id;
    step_payload payload;
};

constexpr std::array steps_on{
    mca_step{step_kind::command, power_command, byte_payload(1)},
    mca_step{step_kind::command, mode_command, mode_payload(16, 3)},
    mca_step{step_kind::command, mode_command, mode_payload(60, 1)},
    mca_step{step_kind::command, mode_command, mode_payload(128, 3)},
    mca_step{step_kind::report, buffer_report, words_payload({0, 0, 0, 128, 0, 8192})},
    mca_step{step_kind::report, interval_report, words_payload({10'000})},
};

constexpr std::array steps_off{
    mca_step{step_kind::report, interval_report, words_payload({0})},
    mca_step{step_kind::command, mode_command, mode_payload(16, 0)},
    mca_step{step_kind::command, mode_command, mode_payload(60, 0)},
    mca_step{step_kind::command, mode_command, mode_payload(128, 0)},
    mca_step{step_kind::command, power_command, byte_payload(0)},
};

platform::return_code run_step(const mca_step& step) {
    const platform::byte_view payload(step.payload.bytes.data(), step.payload.size);
    if (step.kind == step_kind::report) return set_report(service_name, step.id, payload);
    platform::byte_span no_response;
    return send_command(service_name, step.id, payload, no_response);
}

}  // namespace

platform::return_code switch_mca(bool on) {
    print_line(on ? "Turning ON MCA" : "Turning OFF MCA");
    const std::span<const mca_step> steps = on ? std::span<const mca_step>(steps_on) : steps_off;
    for (const mca_step& step : steps) {
        const platform::return_code kr = run_step(step);
        if (!check_success(kr, condition::kr_is_zero)) return kr;
    }
    return platform::success;
}

}  // namespace nrx
