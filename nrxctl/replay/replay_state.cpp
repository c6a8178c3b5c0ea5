#include "nrxctl/replay/replay_state.h"

#include <array>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/whole_records.h"
#include "nrxctl/replay/replay_app.h"

namespace nrx {

namespace {

constexpr std::size_t most_entries = 32;

void append_entry(std::vector<std::uint8_t>& report, const replay_state_entry& entry) {
    append_words(report, {entry.service_id, entry.delay, entry.state});
}

}  // namespace

std::vector<replay_state_entry> replay_status() {
    std::array<std::uint8_t, most_entries * replay_state_entry::wire_size> buffer{};
    platform::byte_span report = buffer;
    const auto kr = get_report(replay_app::service_name, replay_app::state_report, report);
    if (kr != platform::success) return {};
    std::vector<replay_state_entry> entries;
    for_each_record(report, replay_state_entry::wire_size, [&](platform::byte_view entry) {
        const reply_fields fields(entry);
        entries.push_back({fields.u32(0), fields.u32(4), fields.u32(8)});
    });
    return entries;
}

void set_replay_state(std::span<const std::string_view> services, std::uint32_t delay,
                      std::uint32_t state) {
    std::vector<std::uint8_t> report;
    for (const std::string_view service : services) {
        std::int32_t id = 0;
        const bool success = resolve_service_id(service, id);
        if (!check(success, "success")) return;
        append_entry(report, {static_cast<std::uint32_t>(id), delay, state});
    }
    const auto kr = set_report(replay_app::service_name, replay_app::state_report, report);
    check_success(kr, "kr == 0 ");
}

}  // namespace nrx
