#include "nrxctl/inspection/event_statistics.h"

#include <cstdint>
#include <optional>
#include <utility>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/text_line.h"
#include "platform/registry.h"

namespace nrx {

namespace {

constexpr int levels_to_events = 3;

// Goes from an entry to its first child.
bool step_down(platform::service& entry) {
    platform::service child = platform::first_child(entry, platform::service_plane);
    if (!check(child, "child")) return false;
    entry = std::move(child);
    return true;
}

// The numbers of an entry's dictionary "DebugState".
class debug_state {
public:
    explicit debug_state(const platform::service& entry)
        : state_(platform::read_property(entry, "DebugState")) {}

    // The low 32 bits of a count; -1 if it is not there.
    [[nodiscard]] std::int32_t count(std::string_view key) const {
        constexpr std::int64_t missing = -1;
        return static_cast<std::int32_t>(number(key).value_or(missing));
    }

    // A time, from nanoseconds to seconds; 0 if it is not there.
    [[nodiscard]] double seconds(std::string_view key) const {
        constexpr double nanoseconds_per_second = 1000000000;
        const auto nanoseconds = static_cast<std::uint64_t>(number(key).value_or(0));
        return static_cast<double>(nanoseconds) / nanoseconds_per_second;
    }

private:
    [[nodiscard]] std::optional<std::int64_t> number(std::string_view key) const {
        const platform::dictionary* entries = state_ ? state_->entries() : nullptr;
        const platform::property* value = entries != nullptr ? entries->find(key) : nullptr;
        return value != nullptr ? value->number() : std::nullopt;
    }

    std::optional<platform::property> state_;
};

}  // namespace

void print_event_statistics(std::string_view service_name) {
    platform::service entry = find_service(service_name);
    if (!check(entry, "service")) return;
    for (int level = 0; level < levels_to_events; ++level) {
        if (!step_down(entry)) return;
    }
    const std::int32_t events = debug_state(entry).count("_num_events");
    if (!step_down(entry)) return;
    const debug_state queue(entry);
    constexpr int digits = 6;
    text_line line;
    line.text("APEvents    : ").number(events);
    line.text(" [enqueued=").number(queue.count("EnqueueEventCount"));
    line.text(" dropped=").number(queue.count("DroppedEventCount"));
    line.text("; event_delta=").fixed(queue.seconds("LastEventTime"), digits);
    line.text(" dropped_delta=").fixed(queue.seconds("LastDroppedEventTime"), digits);
    print_line(line.text("]").view());
}

}  // namespace nrx
